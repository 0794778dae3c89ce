#include <algorithm>
#include <cstring>
#include <unordered_map>

#include "dictionary_file/dictionary_file.h"
#include "dictionary_file/file_form.h"
#include "graph/graph_copy.h"

namespace Quorle {

namespace {

using Codes = std::unordered_map<std::uint32_t, std::uint32_t>;

class Encoder {
  public:
    explicit Encoder(const WordGraph& graph)
        : edges_(graph.edges()), uses_(graph.edgesEnd()), parents_(uses_), numbers_(uses_) {
        order(graph.root(), 0);
        countCodes();
        header_.words = graph.size();
    }
    std::vector<std::byte> write(std::int32_t maxWordSize);

  private:
    void order(const Edge& to, std::uint32_t from);
    void countCodes();
    std::uint32_t linkCode(std::uint32_t edge) const;

    void put(std::uint32_t value, int bytes);
    void putCode(std::uint32_t code);
    std::uint16_t putTable(Codes& uses, std::uint32_t first, std::size_t most);

    const Edge* edges_;
    // Of each node, by its first edge: how many edges lead to it, the one whose node follows it in
    // the file, and its number when it is shared.
    std::vector<std::uint32_t> uses_;
    std::vector<std::uint32_t> parents_;
    std::vector<std::uint32_t> numbers_;
    std::vector<Edge> nodes_;  // edges to them, in the file's order
    Codes masks_;
    Codes links_;  // codes as if there were no table of links
    DictionaryHeader header_;
    std::vector<std::byte> out_ = std::vector<std::byte>(HeaderSize);
};

// Children before their parent, the last letter's first: a reader that stacks nodes finds each
// letter's new child on top.
void Encoder::order(const Edge& to, std::uint32_t from) {
    if (to.next() == 0 || uses_[to.first]++ > 0) return;
    parents_[to.first] = from;
    for (std::uint32_t i = to.first + to.count(); i-- > to.first;) order(edges_[i], i);
    nodes_.push_back(to);
}

/// What stands for the edge's letter if there is no table of links.
std::uint32_t Encoder::linkCode(std::uint32_t edge) const {
    const Edge& to = edges_[edge];
    const std::uint32_t wordEnds = to.isWord() ? 1 : 0;
    if (to.next() == 0) return EndCode;
    if (parents_[to.first] == edge) return NewChildCode + wordEnds;
    return FirstSharedCode + 2 * numbers_[to.first] + wordEnds;
}

void Encoder::countCodes() {
    for (const Edge& node : nodes_) {
        ++masks_[node.next()];
        for (std::uint32_t i = 0; i < node.count(); ++i) {
            const std::uint32_t code = linkCode(node.first + i);
            if (code >= FirstSharedCode) ++links_[code - FirstSharedCode];
        }
        header_.edges += node.count();
        if (uses_[node.first] > 1) numbers_[node.first] = header_.shared++;
    }
    header_.nodes = static_cast<std::uint32_t>(nodes_.size());
}

void Encoder::put(std::uint32_t value, int bytes) {
    for (; bytes > 0; --bytes, value >>= 8) out_.push_back(static_cast<std::byte>(value));
}

void Encoder::putCode(std::uint32_t code) {
    if (code < OneByteCodes) {
        put(code, 1);
    } else if (code < TwoByteCodes) {
        put(OneByteCodes + ((code - OneByteCodes) >> 8), 1);
        put(code - OneByteCodes, 1);
    } else {
        put(LongCode, 1);
        put(code, 4);
    }
}

/// Writes at most `most` of the values that occur as a table, the most frequent first; the uses
/// become codes from `first` on. Returns how many there are.
std::uint16_t Encoder::putTable(Codes& uses, std::uint32_t first, std::size_t most) {
    std::vector<std::pair<std::uint32_t, std::uint32_t>> table;
    for (const auto& [value, count] : uses) table.emplace_back(~count, value);
    std::sort(table.begin(), table.end());
    table.resize(std::min(table.size(), most));
    uses.clear();
    for (const auto& [count, value] : table) {
        put(value, 4);
        uses.emplace(value, first++);
    }
    return static_cast<std::uint16_t>(table.size());
}

std::vector<std::byte> Encoder::write(std::int32_t maxWordSize) {
    header_.maxWordSize = static_cast<std::uint16_t>(maxWordSize);
    header_.masks = putTable(masks_, FirstMaskCode, MostMasks);
    header_.hotLinks = putTable(links_, FirstSharedCode, MostHotLinks);
    for (const Edge& node : nodes_) {
        if (const auto known = masks_.find(node.next()); known != masks_.end()) {
            putCode(known->second);
        } else {
            put(LongCode, 1);
            put(node.next(), 4);
        }
        for (std::uint32_t i = 0; i < node.count(); ++i) {
            std::uint32_t code = linkCode(node.first + i);
            if (code >= FirstSharedCode) {
                const auto hot = links_.find(code - FirstSharedCode);
                code = hot != links_.end() ? hot->second : code + header_.hotLinks;
            }
            putCode(code);
        }
        if (uses_[node.first] > 1) putCode(ShareCode);
    }
    const auto putHeader = [this] { std::memcpy(out_.data(), &header_, HeaderSize); };
    putHeader();
    header_.checksum = Checksum(out_);
    putHeader();
    return std::move(out_);
}

}  // namespace

std::vector<std::byte> EncodeDictionary(const DictionaryContent& content) {
    const bool isMinimal = content.words.isMinimal();
    return Encoder(isMinimal ? content.words : CopyGraph(content.words, LongestWord))
        .write(content.maxWordSize);
}

}  // namespace Quorle
