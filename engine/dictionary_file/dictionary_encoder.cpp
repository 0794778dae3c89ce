#include <algorithm>
#include <cstring>
#include <unordered_map>

#include "dictionary_file/dictionary_file.h"
#include "dictionary_file/file_form.h"
#include "graph/graph_builder.h"

namespace Quorle {

namespace {

using Bytes = std::vector<std::byte>;
using Codes = std::unordered_map<std::uint32_t, std::uint32_t>;

void Put(Bytes& out, std::uint64_t value, int bytes) {
    for (; bytes > 0; --bytes, value >>= 8) out.push_back(static_cast<std::byte>(value));
}

void PutCode(Bytes& out, std::uint32_t code, bool isLong) {
    if (isLong) return Put(out, LongCode | std::uint64_t{code} << 8, 5);
    if (code < OneByteCodes) return Put(out, code, 1);
    Put(out, OneByteCodes + (code - OneByteCodes) / 256, 1);
    Put(out, code - OneByteCodes, 1);
}

/// Writes at most `most` of the values that occur as a table, the most frequent first; the uses
/// become codes from `first` on. Returns how many there are.
std::uint16_t PutTable(Bytes& out, Codes& uses, std::uint32_t first, std::size_t most) {
    std::vector<std::pair<std::uint32_t, std::uint32_t>> table;
    for (const auto& [value, count] : uses) table.emplace_back(~count, value);
    std::sort(table.begin(), table.end());
    table.resize(std::min(table.size(), most));
    uses.clear();
    for (const auto& [count, value] : table) {
        Put(out, value, 4);
        uses.emplace(value, first++);
    }
    return static_cast<std::uint16_t>(table.size());
}

class Encoder {
  public:
    explicit Encoder(const WordGraph& words) : edges_(words.edges()), nodes_(words.edgesEnd()) {
        order(words.root(), 0);
        header_.words = words.size();
    }

    Bytes encode(std::int32_t maxWordSize) {
        Bytes out(HeaderSize);
        chooseCodes();
        header_.maxWordSize = static_cast<std::uint16_t>(maxWordSize);
        header_.masks = PutTable(out, masks_, FirstMaskCode, MostMasks);
        header_.hotLinks = PutTable(out, hotLinks_, FirstSharedCode, MostHotLinks);
        putNodes(out);
        std::memcpy(out.data(), &header_, HeaderSize);
        header_.checksum = Checksum(out);
        std::memcpy(out.data(), &header_, HeaderSize);
        return out;
    }

  private:
    struct Node {
        std::uint32_t uses = 0;    // edges that lead to it
        std::uint32_t parent = 0;  // that of them which it is stacked for
        std::uint32_t number = 0;  // when it is shared
    };

    // Children before their parent, the last letter's first: a reader that stacks nodes finds each
    // letter's new child on top.
    void order(const Edge& to, std::uint32_t from) {
        if (to.next() == 0 || nodes_[to.first].uses++ > 0) return;
        nodes_[to.first].parent = from;
        for (std::uint32_t i = to.first + to.count(); i-- > to.first;) order(edges_[i], i);
        order_.push_back(to);
    }

    std::uint32_t codeOf(std::uint32_t edge) const {
        const Edge& to = edges_[edge];
        const std::uint32_t wordEnds = to.isWord() ? 1 : 0;
        if (to.next() == 0) return EndCode;
        if (nodes_[to.first].parent == edge) return NewChildCode + wordEnds;
        return FirstSharedCode + 2 * nodes_[to.first].number + wordEnds;
    }

    void chooseCodes() {
        for (const Edge& to : order_) {
            ++masks_[to.next()];
            for (std::uint32_t i = 0; i < to.count(); ++i) {
                codes_.push_back(codeOf(to.first + i));
                if (codes_.back() >= FirstSharedCode) ++hotLinks_[codes_.back() - FirstSharedCode];
            }
            if (nodes_[to.first].uses > 1) nodes_[to.first].number = header_.shared++;
        }
        header_.nodes = static_cast<std::uint32_t>(order_.size());
        header_.edges = static_cast<std::uint32_t>(codes_.size());
    }

    void putNodes(Bytes& out) const {
        auto code = codes_.begin();
        for (const Edge& to : order_) {
            const auto mask = masks_.find(to.next());
            const bool isHot = mask != masks_.end();
            PutCode(out, isHot ? mask->second : to.next(), !isHot);
            for (std::uint32_t i = 0; i < to.count(); ++i, ++code) {
                const auto hot = hotLinks_.find(*code - FirstSharedCode);
                const std::uint32_t cold = *code + (*code < FirstSharedCode ? 0 : header_.hotLinks);
                const std::uint32_t link = hot != hotLinks_.end() ? hot->second : cold;
                PutCode(out, link, link >= TwoByteCodes);
            }
            if (nodes_[to.first].uses > 1) Put(out, ShareCode, 1);
        }
    }

    const Edge* edges_;
    std::vector<Node> nodes_;           // by their first edge
    std::vector<Edge> order_;           // edges to the nodes, in the file's order
    std::vector<std::uint32_t> codes_;  // of their letters, as if there were no table of links
    Codes masks_;
    Codes hotLinks_;
    DictionaryHeader header_;
};

}  // namespace

std::vector<std::byte> EncodeDictionary(const DictionaryContent& content) {
    const bool isMinimal = content.words.isMinimal();
    return Encoder(isMinimal ? content.words : CopyGraph(content.words, LongestWord))
        .encode(content.maxWordSize);
}

}  // namespace Quorle
