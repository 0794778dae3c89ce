#include "word_reader.h"

#include <utility>

WordReader::WordReader(WordGraph graph) : graph_(std::move(graph)) {
    steps_[0] = {graph_.root(), 0, graph_.size(), false};
}

std::string_view WordReader::word(std::uint32_t index) {
    while (index < steps_[depth_].begin || index >= steps_[depth_].end) --depth_;
    while (!steps_[depth_].isWord || index != steps_[depth_].begin) descend(index);
    return {letters_.data(), depth_};
}

// Goes one letter further towards the word.
void WordReader::descend(std::uint32_t index) {
    const Step& step = steps_[depth_];
    const std::uint32_t* node = graph_.nodes() + step.node;
    const std::uint32_t first = step.begin + (step.isWord ? 1 : 0);
    std::uint32_t end = step.end;
    std::uint32_t left = node[0];
    // The last letter whose words do not begin after this one.
    const std::uint32_t* edge = node + 2 * EdgeCount(left) - 1;
    while (first + edge[1] > index) {
        end = first + edge[1];
        left ^= std::bit_floor(left);
        edge -= 2;
    }
    letters_[depth_++] = static_cast<char>('a' + std::bit_width(left) - 1);
    steps_[depth_] = {ChildOf(edge[0]), first + edge[1], end, (edge[0] & WordEnds) != 0};
}
