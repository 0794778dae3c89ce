#include "graph/word_graph.h"

#include <algorithm>
#include <utility>

#include "graph/packed_word.h"

// An edit walks the base graph beside the current one. A node that has become like the base node
// of the same letters is given up for that one, so edits that take each other back leave next to
// nothing behind, and what an edited graph needs is what it differs by.

namespace Quorle {

namespace {

// Nodes of fewer letters are few and on most paths: once edited they stay.
constexpr std::size_t KeptDepth = 3;
constexpr std::size_t Together = 8;
// The most edges that one edit appends: each node on the path, with one edge more. Some behind them
// are written, too.
constexpr std::size_t MostEditedEdges = LongestWord * (2 + std::size_t{Letters}) + Together;

/// An edge of the edited word's path, and the base edge of the same letters.
struct Step {
    Edge* edge;
    const Edge* base;
};

class Edit {
  public:
    explicit Edit(EdgeStore& store) : store_(store), edges_(store.edges()) {}

    // Down the path nodes are copied, and the words behind it counted anew, by one more or less; up
    // again the edges are left out that lead nowhere, and nodes that the base has as well.
    Edge toggle(Edge& root, std::string_view word, std::uint32_t change) {
        std::array<Step, LongestWord + 1> path;
        Step* step = path.data();
        *step = {&root, edges_};
        for (const char letter : word) {
            const std::uint32_t bit = LetterBit(letter);
            own(*step->edge, bit);
            Edge* const edge = edges_ + step->edge->at(bit);
            Edge* const end = edges_ + step->edge->first + step->edge->count();
            // Eight at a time, which as a rule are all; those behind the node change by nothing.
            for (Edge* later = edge + 1; later < end; later += Together) {
                for (std::size_t i = 0; i < Together; ++i)
                    later[i].before += later + i < end ? change : 0;
            }
            const Edge& base = Follow(edges_, *step->base, bit);
            *++step = {edge, &base};
        }
        step->edge->letters ^= WordEnds;
        step->edge->before += change;
        for (bool goOn = true; goOn && step != path.data();) {
            goOn = step->edge->letters == 0;
            --step;
            const auto depth = static_cast<std::size_t>(step - path.data());
            if (goOn) leaveOut(*step->edge, LetterBit(word[depth]));
            if (depth >= KeptDepth && joinBase(*step->edge, *step->base)) goOn = true;
        }
        return *path[2].edge;
    }

  private:
    // Leads the edge to a node that nothing else leads to, with an edge for the letter.
    void own(Edge& to, std::uint32_t bit) {
        const bool hasEdge = (to.letters & bit) != 0;
        if (hasEdge && store_.isEdited(to.first) && store_.references(to.first) == 1) return;
        const std::uint32_t count = to.count();
        const std::uint32_t place = to.at(bit) - to.first;
        const Edge* const from = edges_ + to.first;
        const std::uint32_t first = store_.allocate(hasEdge ? count : count + 1);
        Edge* copy = std::copy_n(from, place, edges_ + first);
        if (!hasEdge) {
            const bool isLast = place == count;
            const std::uint32_t wordsBefore = from[place].before - (from[place].isWord() ? 1 : 0);
            *copy++ = {0, 0, isLast ? CountWords(edges_, to) : wordsBefore};
        }
        std::copy_n(from + place, count - place, copy);
        if (store_.isEdited(to.first)) {  // base nodes lead to base nodes alone
            std::for_each_n(from, count, [this](const Edge& child) { store_.hold(child); });
            store_.release(to);
        }
        to.first = first;
        to.letters |= bit;
    }

    // Takes the letter's edge, which leads nowhere, out of the owned node.
    void leaveOut(Edge& from, std::uint32_t bit) {
        const std::uint32_t count = from.count();
        const std::uint32_t place = from.at(bit) - from.first;
        const std::uint32_t old = from.first;
        from.letters ^= bit;
        from.first = count == 1 ? 0 : store_.allocate(count - 1);
        if (count > 1) {
            Edge* const to = std::copy_n(edges_ + old, place, edges_ + from.first);
            std::copy_n(edges_ + old + place + 1, count - place - 1, to);
        }
        store_.free(old, count);
    }

    bool joinBase(Edge& edge, const Edge& base) {
        if (edge.next() != base.next()) return false;
        const std::uint32_t count = edge.count();
        const Edge* const own = edges_ + edge.first;
        if (!std::equal(own, own + count, edges_ + base.first)) return false;
        if (count > 0) store_.free(edge.first, count);
        edge.first = base.first;
        return true;
    }

    EdgeStore& store_;
    Edge* const edges_;
};

}  // namespace

WordGraph::WordGraph(const std::shared_ptr<EdgeStore>& store)
    : place_(new Place{store, store->edges()[0]}), size_(CountWords(store->edges(), root())) {}

Edge WordGraph::find(std::string_view letters) const {
    return CountingBits([&] {
        Edge place = root();
        for (const char letter : letters) {
            const Edge& edge = Follow(edges(), place, LetterBit(letter));
            place = {edge.first, edge.letters, place.before + edge.before};
        }
        return place;
    });
}

// All memory that an edit can need is asked for before it begins, so that it cannot fail halfway.
Edge WordGraph::set(std::string_view word, bool isHeld) {
    assert(word.size() >= 2 && word.size() <= LongestWord && find(word).isWord() != isHeld);
    if (place_.use_count() != 1) {
        place_.reset(new Place{place_ ? place_->store : std::make_shared<EdgeStore>(), root()});
        place_->store->hold(root());
    }
    EdgeStore& store = *place_->store;
    store.reserve(MostEditedEdges);
    const std::uint32_t change = isHeld ? 1 : ~0U;
    size_ += change;
    return CountingBits([&] { return Edit(store).toggle(place_->root, word, change); });
}

}  // namespace Quorle
