#include "word_reader.h"

#include <utility>

WordReader::WordReader(WordGraph graph) : graph_(std::move(graph)) {
    steps_[0] = stepTo(graph_.root(), 0, graph_.size(), 0);
}

std::string_view WordReader::word(std::uint32_t index) {
    if (index < steps_[depth_].begin) {
        depth_ = 0;
        steps_[0] = stepTo(graph_.root(), 0, graph_.size(), 0);
    }
    while (index >= steps_[depth_].end) --depth_;
    while (steps_[depth_].isWord == 0 || index != steps_[depth_].begin) descend(index);
    return {letters_.data(), depth_};
}

WordReader::Step WordReader::stepTo(NodeIndex node, std::uint32_t begin, std::uint32_t end,
                                    std::uint32_t isWord) const {
    return {begin, end, isWord, graph_.nodes()[node], node + 1};
}

// Goes one letter further towards the word: the last one whose words do not begin after it.
void WordReader::descend(std::uint32_t index) {
    const std::uint32_t* nodes = graph_.nodes();
    Step& step = steps_[depth_];
    const std::uint32_t first = step.begin + step.isWord;
    std::uint32_t end = step.end;
    for (std::uint32_t later = step.left & (step.left - 1); later != 0; later &= later - 1) {
        const std::uint32_t next = first + nodes[step.link + 3];
        if (next > index) {
            end = next;
            break;
        }
        step.left = later;
        step.link += 2;
    }
    letters_[depth_++] = static_cast<char>('a' + std::countr_zero(step.left));
    const std::uint32_t link = nodes[step.link];
    steps_[depth_] = stepTo(ChildOf(link), first + nodes[step.link + 1], end, link >> 31);
}
