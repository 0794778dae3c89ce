#include "graph_edit.h"

#include <algorithm>

#include "word_graph.h"

// An edit walks the base graph beside the current one. A node that has become like the base node
// of the same letters is given up for that one, so edits that take each other back leave nothing
// behind, and what an edited graph needs is what it differs by.

NodeIndex GraphEdit::add(NodeIndex root, std::string_view word) {
    return addBelow(root, store_.baseRoot(), word);
}

NodeIndex GraphEdit::remove(NodeIndex root, std::string_view word) {
    return removeBelow(root, store_.baseRoot(), word);
}

NodeIndex GraphEdit::addBelow(NodeIndex node, NodeIndex base, std::string_view rest) {
    const std::uint32_t bit = LetterBit(rest.front());
    node = withEdge(unshared(node), bit);
    shiftSkips(node, bit, 1);
    std::uint32_t& link = store_.words()[node + LinkOffset(store_.words()[node], bit)];
    if (rest.size() == 1) {
        link |= WordEnds;
    } else {
        const NodeIndex child = addBelow(ChildOf(link), baseChild(base, bit), rest.substr(1));
        link = (link & WordEnds) | child;
    }
    return baseIfSame(node, base);
}

NodeIndex GraphEdit::removeBelow(NodeIndex node, NodeIndex base, std::string_view rest) {
    const std::uint32_t bit = LetterBit(rest.front());
    node = unshared(node);
    shiftSkips(node, bit, ~0U);
    std::uint32_t& link = store_.words()[node + LinkOffset(store_.words()[node], bit)];
    if (rest.size() == 1) {
        link &= ~WordEnds;
    } else {
        const NodeIndex child = removeBelow(ChildOf(link), baseChild(base, bit), rest.substr(1));
        link = (link & WordEnds) | child;
    }
    if (link == NoNode) node = withoutEdge(node, bit);
    return baseIfSame(node, base);
}

// The node itself where nothing else links to it, else a copy.
NodeIndex GraphEdit::unshared(NodeIndex node) {
    const bool edited = store_.isEdited(node);
    if (edited && store_.references(node) == 1) return node;
    std::uint32_t* words = store_.words();
    const std::uint32_t edges = EdgeCount(words[node]);
    const NodeIndex copy = store_.allocate(edges);
    std::copy_n(words + node, 1 + 2 * edges, words + copy);
    if (edited) {
        for (std::uint32_t i = 0; i < edges; ++i) store_.hold(ChildOf(words[copy + 1 + 2 * i]));
        store_.release(node);
    }
    return copy;
}

// The node with an edge for the letter; a new one leads nowhere yet.
NodeIndex GraphEdit::withEdge(NodeIndex node, std::uint32_t bit) {
    std::uint32_t* words = store_.words();
    const std::uint32_t mask = words[node];
    if ((mask & bit) != 0) return node;
    const std::uint32_t edges = EdgeCount(mask);
    const std::uint32_t offset = LinkOffset(mask, bit);
    const bool last = offset == 1 + 2 * edges;
    const NodeIndex grown = store_.allocate(edges + 1);
    words[grown] = mask | bit;
    std::copy_n(words + node + 1, offset - 1, words + grown + 1);
    words[grown + offset] = NoNode;
    words[grown + offset + 1] = last ? CountWords(words, node) : words[node + offset + 1];
    std::copy_n(words + node + offset, 1 + 2 * edges - offset, words + grown + offset + 2);
    store_.free(node, edges);
    return grown;
}

// The node without the letter's edge, which leads nowhere; NoNode when it was the only one.
NodeIndex GraphEdit::withoutEdge(NodeIndex node, std::uint32_t bit) {
    std::uint32_t* words = store_.words();
    const std::uint32_t mask = words[node];
    const std::uint32_t edges = EdgeCount(mask);
    NodeIndex shrunk = NoNode;
    if (edges > 1) {
        const std::uint32_t offset = LinkOffset(mask, bit);
        shrunk = store_.allocate(edges - 1);
        words[shrunk] = mask & ~bit;
        std::copy_n(words + node + 1, offset - 1, words + shrunk + 1);
        std::copy_n(words + node + offset + 2, 2 * edges - offset - 1, words + shrunk + offset);
    }
    store_.free(node, edges);
    return shrunk;
}

NodeIndex GraphEdit::baseChild(NodeIndex base, std::uint32_t bit) const {
    const std::uint32_t* words = store_.words();
    const std::uint32_t mask = words[base];
    return (mask & bit) != 0 ? ChildOf(words[base + LinkOffset(mask, bit)]) : NoNode;
}

NodeIndex GraphEdit::baseIfSame(NodeIndex node, NodeIndex base) {
    if (node == NoNode || base == NoNode) return node;
    const std::uint32_t* words = store_.words();
    const std::uint32_t edges = EdgeCount(words[node]);
    if (!std::equal(words + node, words + node + 1 + 2 * edges, words + base)) return node;
    store_.free(node, edges);
    return base;
}

// The words of all later letters move by one.
void GraphEdit::shiftSkips(NodeIndex node, std::uint32_t bit, std::uint32_t change) {
    std::uint32_t* words = store_.words();
    const std::uint32_t end = 1 + 2 * EdgeCount(words[node]);
    for (std::uint32_t i = LinkOffset(words[node], bit) + 2; i < end; i += 2) {
        words[node + i + 1] += change;
    }
}
