#include "dictionary_decoder.h"

#include <algorithm>

#include "populate.h"

// Links lead to nodes read before, so there are no cycles; words and heights add up as the nodes
// come, so no walk of the finished graph is needed to know that it is sound.
//
// Codes of one and two bytes, links to all kinds of nodes alternate at random: they are told apart
// without a branch.

namespace {

std::uint32_t Byte(const std::byte* at) {
    return std::to_integer<std::uint32_t>(*at);
}

std::uint32_t FourBytes(const std::byte* at) {
    return Byte(at) | Byte(at + 1) << 8 | Byte(at + 2) << 16 | Byte(at + 3) << 24;
}

/// 1 when a code that is not long has two bytes.
std::uint32_t IsTwo(std::uint32_t first) {
    static_assert(OneByteCodes == 128);
    return first >> 7;
}

std::uint32_t TwoByteCode(std::uint32_t first, std::uint32_t second) {
    return OneByteCodes + ((first - OneByteCodes) << 8) + second;
}

/// The second byte of a code. A code of one byte may be the last there is.
template <bool NearEnd>
std::uint32_t Second(const std::byte* code, std::uint32_t first) {
    return NearEnd && IsTwo(first) == 0 ? 0 : Byte(code + 1);
}

bool IsMask(std::uint32_t mask) {
    return mask != 0 && mask >> Letters == 0;
}

std::uint32_t CellsOf(std::uint32_t mask) {
    return 1 + 2 * EdgeCount(mask);
}

}  // namespace

std::shared_ptr<NodeStore> DictionaryDecoder::read() {
    if (!plausible()) return nullptr;
    store_ = std::make_shared<NodeStore>();
    const std::size_t all = 1 + header_.nodes + 2 * std::size_t{header_.edges};
    store_->reserve(all - 1);
    store_->append(all - 1);
    cells_ = store_->words();
    cellsEnd_ = cells_ + all;
    Populate(cells_, all * sizeof *cells_);
    if (!readTables() || !readNodes() || !finished()) return nullptr;
    store_->closeBase(header_.nodes == 0 ? NoNode : nodes_[0].node);
    return std::move(store_);
}

// The counts against the bytes there are, before any memory is asked for.
bool DictionaryDecoder::plausible() const {
    const auto bytes = static_cast<std::size_t>(end_ - code_);
    const std::size_t tables = 4 * (std::size_t{header_.masks} + header_.hotLinks);
    return header_.masks <= MostMasks && header_.hotLinks <= MostHotLinks && tables <= bytes &&
           std::size_t{header_.nodes} + header_.edges + header_.shared <= bytes - tables;
}

std::uint32_t DictionaryDecoder::takeFour() {
    const std::uint32_t value = FourBytes(code_);
    code_ += 4;
    return value;
}

bool DictionaryDecoder::readTables() {
    const std::size_t count = MostWaiting + 1 + std::size_t{header_.shared};
    nodes_.reserve(count);
    Populate(nodes_.data(), count * sizeof nodes_[0]);
    nodes_.resize(count);
    return readShapes() && readLinkStarts();
}

bool DictionaryDecoder::readShapes() {
    shapes_.resize(header_.masks);
    for (Shape& shape : shapes_) {
        shape.mask = takeFour();
        shape.cells = CellsOf(shape.mask);
        if (!IsMask(shape.mask)) return false;
    }
    return true;
}

bool DictionaryDecoder::readLinkStarts() {
    links_[EndCode] = {1, 0, 0};
    links_[NewChildCode] = {0, 0, 1};
    links_[NewWordCode] = {1, 0, 1};
    firstNumber_ = FirstSharedCode + header_.hotLinks;
    for (std::uint32_t code = FirstSharedCode; code < firstNumber_; ++code) {
        const std::uint32_t link = takeFour();
        if (link >> 1 >= header_.shared) return false;
        links_[code] = {FirstLink + link, 0, 0};
    }
    for (std::uint32_t code = firstNumber_; code < OneByteCodes; ++code) {
        links_[code] = {FirstLink + code - firstNumber_, 0, 0};
    }
    for (std::uint32_t first = OneByteCodes; first < LongCode; ++first) {
        links_[first] = {FirstLink + TwoByteCode(first, 0) - firstNumber_, 0xff, 0};
    }
    return true;
}

[[gnu::flatten]] bool DictionaryDecoder::readNodes() {
    Progress progress{code_, cells_ + 1, 0, 0};  // kept in registers here
    while (end_ - progress.code >= MostNodeBytes) {
        if (!readNode<false>(progress)) return false;
    }
    while (progress.code != end_) {
        if (!readNode<true>(progress)) return false;
    }
    progress_ = progress;
    return true;
}

// A node, or that the newest one is shared.
template <bool NearEnd>
inline bool DictionaryDecoder::readNode(Progress& progress) {
    const std::byte* code = progress.code;
    if (Byte(code) == ShareCode) return share(progress);
    Shape shape{};
    if (!readShape<NearEnd>(code, shape) || shape.cells > cellsEnd_ - progress.cell) return false;
    std::uint32_t* cell = progress.cell;
    std::uint32_t* const end = cell + shape.cells;
    std::uint32_t waiting = progress.waiting;
    std::uint64_t words = 0;
    std::uint32_t height = 0;
    for (*cell++ = shape.mask; cell != end; cell += 2) {
        LinkStart link{};
        if (!readLink<NearEnd>(code, link)) return false;
        if (link.isNew > waiting || link.link >> 1 > progress.shared) return false;
        const std::uint32_t toNew = (0U - link.isNew) & (MostWaiting + 1 - waiting);
        const Read& child = nodes_[MostWaiting + (link.link >> 1) - toNew];
        waiting -= link.isNew;
        cell[0] = child.node | (link.link << 31);
        cell[1] = static_cast<std::uint32_t>(words);
        words += (link.link & 1) + child.words;
        height = std::max(height, child.height + 1);
    }
    if (words > INT32_MAX || height > LongestWord || waiting == MostWaiting) return false;
    nodes_[waiting] = {static_cast<NodeIndex>(progress.cell - cells_),
                       static_cast<std::uint32_t>(words), height};
    progress = {code, end, waiting + 1, progress.shared};
    return true;
}

template <bool NearEnd>
inline bool DictionaryDecoder::readShape(const std::byte*& code, Shape& shape) const {
    if (!isThere<NearEnd>(code)) return false;
    const std::uint32_t first = Byte(code);
    if (first == LongCode) [[unlikely]] {
        shape.mask = FourBytes(code + 1);
        shape.cells = CellsOf(shape.mask);
        code += LongCodeSize;
        return IsMask(shape.mask);
    }
    const std::uint32_t isTwo = IsTwo(first);
    const std::uint32_t second = Second<NearEnd>(code, first);
    const std::uint32_t number = first + ((0 - isTwo) & (TwoByteCode(first, second) - first));
    code += 1 + isTwo;
    if (number - FirstMaskCode >= shapes_.size()) return false;
    shape = shapes_[number - FirstMaskCode];
    return true;
}

template <bool NearEnd>
inline bool DictionaryDecoder::readLink(const std::byte*& code, LinkStart& link) const {
    if (!isThere<NearEnd>(code)) return false;
    const std::uint32_t first = Byte(code);
    if (first == LongCode) [[unlikely]] {
        const std::uint32_t number = FourBytes(code + 1);
        code += LongCodeSize;
        link = {FirstLink + number - firstNumber_, 0, 0};
        return number >= TwoByteCodes;
    }
    link = links_[first];
    link.link += link.secondMask & Second<NearEnd>(code, first);
    code += 1 + IsTwo(first);
    return true;
}

template <bool NearEnd>
inline bool DictionaryDecoder::isThere(const std::byte* code) const {
    if (!NearEnd) return true;
    if (code == end_) return false;
    const std::uint32_t first = Byte(code);
    return end_ - code >= (first == LongCode ? LongCodeSize : 1 + std::ptrdiff_t{IsTwo(first)});
}

inline bool DictionaryDecoder::share(Progress& progress) {
    if (progress.waiting == 0 || progress.shared == header_.shared) return false;
    nodes_[MostWaiting + ++progress.shared] = nodes_[progress.waiting - 1];
    ++progress.code;
    return true;
}

// Exactly one node has no parent, all counts are used up, and no word has one letter only.
bool DictionaryDecoder::finished() const {
    if (progress_.cell != cellsEnd_ || progress_.shared != header_.shared) return false;
    if (header_.nodes == 0) return header_.words == 0 && progress_.waiting == 0;
    if (progress_.waiting != 1 || nodes_[0].words != header_.words) return false;
    const std::uint32_t* root = cells_ + nodes_[0].node;
    for (std::uint32_t i = 0; i < EdgeCount(root[0]); ++i) {
        if ((root[1 + 2 * i] & WordEnds) != 0) return false;
    }
    return true;
}
