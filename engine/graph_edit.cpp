#include "graph_edit.h"

#include <algorithm>
#include <array>

#include "word_graph.h"

// An edit walks the base graph beside the current one. A node that has become like the base node
// of the same letters is given up for that one, so edits that take each other back leave nothing
// behind, and what an edited graph needs is what it differs by.

namespace {

/// A node of the edited word's path, the base node of the same letters, and the edge taken.
struct Place {
    NodeIndex node;
    NodeIndex base;
    std::uint32_t bit;
    NodeIndex edge;  // where the edge's link stands
};

}  // namespace

NodeIndex GraphEdit::add(NodeIndex root, std::string_view word) {
    return edit(root, word, 1);
}

NodeIndex GraphEdit::remove(NodeIndex root, std::string_view word) {
    return edit(root, word, ~0U);
}

NodeIndex GraphEdit::edit(NodeIndex root, std::string_view word, std::uint32_t change) {
#if defined(__x86_64__)
    if (HasBitCount()) return toggleByInstruction(root, word, change);
#endif
    return toggle(root, word, change);
}

#if defined(__x86_64__)
[[gnu::target("popcnt"), gnu::flatten]] NodeIndex GraphEdit::toggleByInstruction(
    NodeIndex root, std::string_view word, std::uint32_t change) {
    return toggle(root, word, change);
}
#endif

// Down the path nodes are copied, and the words behind it counted anew, by one more or less; up
// again they are linked, and those left out that the graph does not need.
NodeIndex GraphEdit::toggle(NodeIndex root, std::string_view word, std::uint32_t change) {
    std::array<Place, LongestWord> path;
    Place* place = path.data();
    NodeIndex node = root;
    NodeIndex base = store_.baseRoot();
    for (const char letter : word) {
        const std::uint32_t bit = LetterBit(letter);
        node = ownWithEdge(node, bit);
        std::uint32_t* words = store_.words();
        const std::uint32_t edge = node + LinkOffset(words[node], bit);
        const std::uint32_t end = node + 1 + 2 * EdgeCount(words[node]);
        for (std::uint32_t later = edge + 2; later < end; later += 2) words[later + 1] += change;
        *place++ = {node, base, bit, edge};
        node = ChildOf(words[edge]);
        base = baseChild(base, bit);
    }
    store_.words()[place[-1].edge] ^= WordEnds;
    while (place != path.data()) {
        --place;
        std::uint32_t& link = store_.words()[place->edge];
        link = (link & WordEnds) | node;
        node = link == NoNode ? withoutEdge(place->node, place->bit) : place->node;
        node = baseIfSame(node, place->base);
    }
    return node;
}

// A node that nothing else links to, with an edge for the letter; a new edge leads nowhere yet.
NodeIndex GraphEdit::ownWithEdge(NodeIndex node, std::uint32_t bit) {
    std::uint32_t* words = store_.words();
    const std::uint32_t mask = words[node];
    const bool hasEdge = (mask & bit) != 0;
    const bool isEdited = store_.isEdited(node);
    const bool isShared = !isEdited || store_.references(node) > 1;
    if (hasEdge && !isShared) return node;
    const std::uint32_t edges = EdgeCount(mask);
    const std::uint32_t offset = LinkOffset(mask, bit);
    const std::uint32_t end = 1 + 2 * edges;
    const NodeIndex copy = store_.allocate(hasEdge ? edges : edges + 1);
    std::uint32_t* to = words + copy;
    *to++ = mask | bit;
    to = std::copy_n(words + node + 1, offset - 1, to);
    if (!hasEdge) {
        *to++ = NoNode;
        *to++ = offset == end ? CountWords(words, node) : words[node + offset + 1];
    }
    std::copy_n(words + node + offset, end - offset, to);
    if (isEdited && isShared) {
        for (std::uint32_t i = 1; i < end; i += 2) store_.hold(ChildOf(words[node + i]));
        store_.release(node);
    } else if (isEdited) {
        store_.free(node, edges);
    }
    return copy;
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
