#include "word_cursor.h"

#include <algorithm>
#include <utility>

WordCursor::WordCursor(WordGraph graph, std::string_view prefix) : graph_(std::move(graph)) {
    GraphPlace place{};
    if (prefix.size() > LongestWord || !graph_.find(prefix, place)) return;
    std::copy(prefix.begin(), prefix.end(), letters_.begin());
    depth_ = top_ = prefix.size();
    prefixIsNext_ = place.isWord;
    steps_[depth_] = {place.node, graph_.nodes()[place.node]};
}

bool WordCursor::next(std::string_view& word) {
    if (!prefixIsNext_ && !goOn()) return false;
    prefixIsNext_ = false;
    word = {letters_.data(), depth_};
    return true;
}

// Goes to where the next word ends.
bool WordCursor::goOn() {
    const std::uint32_t* nodes = graph_.nodes();
    while (true) {
        Step& step = steps_[depth_];
        if (step.left == 0) {
            if (depth_ == top_) return false;
            --depth_;
            continue;
        }
        const std::uint32_t bit = step.left & -step.left;
        step.left ^= bit;
        letters_[depth_++] = static_cast<char>('a' + std::countr_zero(bit));
        const std::uint32_t link = nodes[step.node + LinkOffset(nodes[step.node], bit)];
        const NodeIndex child = ChildOf(link);
        steps_[depth_] = {child, nodes[child]};
        if ((link & WordEnds) != 0) return true;
    }
}
