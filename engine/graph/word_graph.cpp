#include "graph/word_graph.h"

#include <utility>

#include "graph/bit_count.h"
#include "graph/graph_edit.h"
#include "graph/packed_word.h"

namespace Quorle {

WordGraph::WordGraph(std::shared_ptr<EdgeStore> store)
    : store_(std::move(store)),
      root_(store_->edges()[0]),
      size_(CountWords(store_->edges(), root_)) {}

WordGraph::WordGraph(const WordGraph& other)
    : store_(other.store_), root_(other.root_), size_(other.size_) {
    if (store_) store_->hold(root_);
}

WordGraph::WordGraph(WordGraph&& other) noexcept
    : store_(std::move(other.store_)),
      root_(std::exchange(other.root_, {})),
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

Edge WordGraph::find(std::string_view letters) const {
    return CountingBits([&] {
        Edge place = root_;
        for (const char letter : letters) {
            const std::uint32_t bit = LetterBit(letter);
            if ((place.letters & bit) == 0) return Edge{};
            const Edge& edge = edges()[place.at(bit)];
            place = {edge.letters, edge.first, place.before + edge.before};
        }
        return place;
    });
}

bool WordGraph::add(std::string_view word) {
    assert(!word.empty() && word.size() <= LongestWord);
    if (find(word).isWord()) return false;
    prepareEdit();
    AddWord(*store_, root_, word);
    ++size_;
    return true;
}

bool WordGraph::remove(std::string_view word) {
    if (!find(word).isWord()) return false;
    prepareEdit();
    RemoveWord(*store_, root_, word);
    --size_;
    return true;
}

// All memory that an edit can need is asked for before it begins, so that it cannot fail halfway.
void WordGraph::prepareEdit() {
    if (!store_) store_ = std::make_shared<EdgeStore>();
    store_->reserve(MostEditedEdges);
}

}  // namespace Quorle
