#include "word_graph.h"

#include <algorithm>
#include <array>
#include <utility>

#include "graph_edit.h"

namespace {

constexpr std::uint32_t EmptyNode[1] = {0};

/// Goes on from `place` along the text as far as words do; false when that is not to its end.
inline bool Follow(const std::uint32_t* nodes, const char* text, GraphPlace& place) {
    for (; *text != 0; ++text) {
        const std::uint32_t letter = static_cast<std::uint32_t>(*text) - 'a';
        const std::uint32_t mask = nodes[place.node];
        if (letter >= Letters || (mask >> letter & 1) == 0) return false;
        const std::uint32_t* link = nodes + place.node + LinkOffset(mask, 1U << letter);
        place.node = ChildOf(link[0]);
        place.isWord = (link[0] & WordEnds) != 0;
        place.firstWord += link[1] + (place.isWord ? 1 : 0);
    }
    return true;
}

#if defined(__x86_64__)
[[gnu::target("popcnt"), gnu::flatten]] bool FollowByInstruction(const std::uint32_t* nodes,
                                                                 const char* text,
                                                                 GraphPlace& place) {
    return Follow(nodes, text, place);
}
#endif

}  // namespace

WordGraph::WordGraph(std::shared_ptr<NodeStore> store, std::uint32_t size)
    : store_(std::move(store)), root_(store_->baseRoot()), size_(size) {}

WordGraph::WordGraph(const WordGraph& other)
    : store_(other.store_), root_(other.root_), size_(other.size_) {
    if (store_) store_->hold(root_);
}

WordGraph::WordGraph(WordGraph&& other) noexcept
    : store_(std::move(other.store_)),
      root_(std::exchange(other.root_, NoNode)),
      size_(std::exchange(other.size_, 0)) {}

WordGraph& WordGraph::operator=(WordGraph other) noexcept {
    std::swap(store_, other.store_);
    std::swap(root_, other.root_);
    std::swap(size_, other.size_);
    return *this;
}

WordGraph::~WordGraph() {
    if (store_) store_->release(root_);
}

const std::uint32_t* WordGraph::nodes() const {
    return store_ ? store_->words() : EmptyNode;
}

bool WordGraph::find(const char* text, GraphPlace& place) const {
    place = {root_, 0, false};
#if defined(__x86_64__)
    if (HasBitCount()) return FollowByInstruction(nodes(), text, place);
#endif
    return Follow(nodes(), text, place);
}

bool WordGraph::find(std::string_view letters, GraphPlace& place) const {
    std::array<char, LongestWord + 1> text{};
    std::copy(letters.begin(), letters.end(), text.begin());
    return find(text.data(), place);
}

bool WordGraph::contains(std::string_view word) const {
    GraphPlace place{};
    return find(word, place) && place.isWord;
}

bool WordGraph::hasPrefix(std::string_view prefix) const {
    GraphPlace place{};
    return find(prefix, place);
}

std::uint32_t WordGraph::rank(std::string_view word) const {
    const std::uint32_t* words = nodes();
    NodeIndex node = root_;
    std::uint32_t before = 0;
    for (std::size_t i = 0; i < word.size(); ++i) {
        const std::uint32_t mask = words[node];
        const std::uint32_t bit = LetterBit(word[i]);
        const std::uint32_t* edge = words + node + LinkOffset(mask, bit);
        if ((mask & bit) == 0) {
            // All words of this node that come before the letter, or all there are.
            const bool last = edge == words + node + 1 + 2 * EdgeCount(mask);
            return before + (last ? CountWords(words, node) : edge[1]);
        }
        before += edge[1];
        if (i + 1 < word.size() && (edge[0] & WordEnds) != 0) ++before;
        node = ChildOf(edge[0]);
    }
    return before;
}

std::int64_t WordGraph::firstIndex(std::string_view prefix) const {
    GraphPlace place{};
    if (size_ == 0 || !find(prefix, place)) return -1;
    return std::int64_t{place.firstWord} - (place.isWord ? 1 : 0);
}

std::uint32_t WordGraph::wordsBelow(std::string_view prefix) const {
    GraphPlace place{};
    if (!find(prefix, place)) return 0;
    return CountWords(nodes(), place.node) + (place.isWord ? 1 : 0);
}

bool WordGraph::add(std::string_view word) {
    if (contains(word)) return false;
    prepareEdit();
    root_ = GraphEdit(*store_).add(root_, word);
    ++size_;
    return true;
}

bool WordGraph::remove(std::string_view word) {
    if (!contains(word)) return false;
    prepareEdit();
    root_ = GraphEdit(*store_).remove(root_, word);
    --size_;
    return true;
}

// All memory that an edit can need is asked for before it begins, so that it cannot fail halfway.
void WordGraph::prepareEdit() {
    if (!store_) store_ = std::make_shared<NodeStore>();
    store_->reserve(GraphEdit::MostWords);
}

std::uint32_t CountWords(const std::uint32_t* nodes, NodeIndex node) {
    std::uint32_t count = 0;
    // A node's words are those before its last letter, and that letter's own.
    while (nodes[node] != 0) {
        const std::uint32_t* last = nodes + node + 2 * EdgeCount(nodes[node]) - 1;
        count += last[1] + (last[0] >> 31);
        node = ChildOf(last[0]);
    }
    return count;
}
