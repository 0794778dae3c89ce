#include "graph_builder.h"

#include <algorithm>

namespace {

constexpr std::size_t FirstRegisterSize = 1024;
constexpr std::size_t SlotsMovedAtOnce = 8;
constexpr std::size_t CellsOfAWord = 4;  // and less, in a list of many words

std::uint32_t Hash(std::uint32_t mask, const std::uint32_t* content, std::uint32_t edges) {
    std::uint64_t hash = mask * 0x9e3779b97f4a7c15U;
    // The skips follow from the links: words below equal children are equally many.
    for (std::uint32_t i = 0; i < edges; ++i) {
        hash = (std::rotl(hash, 23) ^ content[2 * i]) * 0xd6e8feb86659fd93U;
    }
    return static_cast<std::uint32_t>(hash ^ (hash >> 32));
}

}  // namespace

GraphBuilder::GraphBuilder(std::size_t expectedWords)
    : nodes_(std::make_shared<NodeStore>()),
      register_(std::bit_ceil(std::max(FirstRegisterSize, expectedWords / 2))),
      room_(CellsOfAWord * expectedWords) {
    nodes_->reserve(room_);
}

void GraphBuilder::add(std::string_view word) {
    const std::size_t most = std::min(word.size(), lastSize_);
    std::size_t common = 0;
    while (common < most && word[common] == last_[common]) ++common;
    closeNodes(common);
    for (std::size_t i = common; i < word.size(); ++i) {
        OpenNode& node = path_[i];
        last_[i] = word[i];
        node.open(LetterBit(word[i]), NoNode);
        path_[i + 1].mask = path_[i + 1].edges = path_[i + 1].words = 0;
    }
    lastSize_ = word.size();
    OpenNode& end = path_[lastSize_ - 1];
    end.content[2 * end.edges - 2] |= WordEnds;
    ++end.words;
    ++size_;
}

WordGraph GraphBuilder::finish() {
    closeNodes(0);
    return finish(store(path_[0]), size_);
}

WordGraph GraphBuilder::finish(NodeIndex root, std::uint32_t words) {
    nodes_->closeBase(root);
    nodes_->shrink();
    return {std::move(nodes_), words};
}

// Stores the nodes of the last word below `depth` letters, deepest first, and links to them.
void GraphBuilder::closeNodes(std::size_t depth) {
    for (std::size_t i = lastSize_; i > depth; --i) {
        OpenNode& parent = path_[i - 1];
        parent.content[2 * parent.edges - 2] |= store(path_[i]);
        parent.words += path_[i].words;
    }
}

// Zeroed memory that the system hands out page by page as it is used: clearing a large table at
// once would take long.
GraphBuilder::Register::Register(std::size_t slotCount)
    : slots(static_cast<Slot*>(std::calloc(slotCount, sizeof(Slot)))), size(slotCount) {
    if (slotCount != 0 && !slots) throw std::bad_alloc();
}

// The slot of the stored node of this content, or the free one where it belongs.
GraphBuilder::Slot& GraphBuilder::find(const Register& table, const OpenNode& open,
                                       std::uint32_t hash) const {
    const std::size_t last = table.size - 1;
    for (std::size_t at = hash & last;; at = (at + 1) & last) {
        Slot& slot = table.slots[at];
        if (slot.node == NoNode) return slot;
        if (slot.hash != hash) continue;
        const std::uint32_t* node = nodes_->words() + slot.node;
        if (node[0] == open.mask &&
            std::equal(open.content.data(), open.content.data() + 2 * open.edges, node + 1)) {
            return slot;
        }
    }
}

// The stored node of this content: one that was there before, or a new one.
NodeIndex GraphBuilder::store(const OpenNode& open) {
    if (open.mask == 0) return NoNode;
    const std::uint32_t hash = Hash(open.mask, open.content.data(), open.edges);
    NodeIndex stored = find(register_, open, hash).node;
    if (stored == NoNode && moving_.size != 0) stored = find(moving_, open, hash).node;
    if (stored != NoNode) return stored;
    growRegister();
    const NodeIndex index = append(open);
    find(register_, open, hash) = {index, hash};
    ++stored_;
    return index;
}

NodeIndex GraphBuilder::append(const OpenNode& open) {
    const std::size_t size = 1 + 2 * std::size_t{open.edges};
    if (room_ < size) {
        room_ = std::max(size, nodes_->size() / 2);
        nodes_->reserve(room_);
    }
    room_ -= size;
    const NodeIndex index = nodes_->append(size);
    std::uint32_t* node = nodes_->words() + index;
    node[0] = open.mask;
    std::copy_n(open.content.data(), 2 * open.edges, node + 1);
    return index;
}

void GraphBuilder::growRegister() {
    if (stored_ * 2 >= register_.size) {
        Register larger(2 * register_.size);
        moving_ = std::move(register_);
        register_ = std::move(larger);
        moved_ = 0;
    }
    if (moving_.size == 0) return;
    const std::size_t last = register_.size - 1;
    const std::size_t end = std::min(moved_ + SlotsMovedAtOnce, moving_.size);
    for (; moved_ < end; ++moved_) {
        const Slot& slot = moving_.slots[moved_];
        if (slot.node == NoNode) continue;
        std::size_t at = slot.hash & last;
        while (register_.slots[at].node != NoNode) at = (at + 1) & last;
        register_.slots[at] = slot;
    }
    if (moved_ == moving_.size) moving_ = Register(0);
}
