#include "dictionary_decoder.h"

#include <algorithm>

#include "populate.h"
#include "without_branches.h"

// Links lead to nodes read before, so there are no cycles; words and heights add up as the nodes
// come, so no walk of the finished graph is needed to know that it is sound.

inline std::uint32_t CodeReader::readFour() {
    std::uint32_t value = 0;
    for (int i = 0; i < 4; ++i) value |= std::to_integer<std::uint32_t>(*at_++) << (8 * i);
    return value;
}

// Codes of one and two bytes alternate at random: they are told apart without a branch.
inline bool CodeReader::read(std::uint32_t& code) {
    if (left() < 2 || isLong()) return readSlowly(code);
    const auto first = std::to_integer<std::uint32_t>(at_[0]);
    const auto second = std::to_integer<std::uint32_t>(at_[1]);
    const std::uint32_t isTwo = 1 - IsLess(first, OneByteCodes);
    code = Choose(isTwo, ((first - OneByteCodes) << 8) + second + OneByteCodes, first);
    at_ += 1 + isTwo;
    return true;
}

// The last byte of all, and codes of five bytes.
bool CodeReader::readSlowly(std::uint32_t& code) {
    if (isLong() && left() >= 5) {
        ++at_;
        code = readFour();
        return true;
    }
    if (left() == 0 || *at_ >= std::byte{OneByteCodes}) return false;
    code = std::to_integer<std::uint32_t>(*at_++);
    return true;
}

DictionaryDecoder::DictionaryDecoder(const DictionaryHeader& header,
                                     std::span<const std::byte> bytes)
    : header_(header), codes_(bytes) {}

std::shared_ptr<NodeStore> DictionaryDecoder::read() {
    if (!plausible()) return nullptr;
    store_ = std::make_shared<NodeStore>();
    all_ = 1 + header_.nodes + 2 * std::size_t{header_.edges};
    store_->reserve(all_ - 1);
    store_->append(all_ - 1);
    cells_ = store_->words();
    Populate(cells_, all_ * sizeof *cells_);
    if (!readTables() || !readNodes() || !finished()) return nullptr;
    store_->closeBase(header_.nodes == 0 ? NoNode : nodes_[0].node);
    return std::move(store_);
}

// The counts against the bytes there are, before any memory is asked for.
bool DictionaryDecoder::plausible() const {
    const std::size_t bytes = codes_.left();
    const std::size_t tables = 4 * (std::size_t{header_.masks} + header_.hotLinks);
    return header_.masks <= MostMasks && header_.hotLinks <= MostHotLinks && tables <= bytes &&
           std::size_t{header_.nodes} + header_.edges + header_.shared <= bytes - tables;
}

bool DictionaryDecoder::readTables() {
    masks_.resize(header_.masks);
    for (std::uint32_t& mask : masks_) mask = codes_.readFour();
    const std::size_t count = MostWaiting + 1 + std::size_t{header_.shared};
    nodes_.reserve(count);
    Populate(nodes_.data(), count * sizeof nodes_[0]);
    nodes_.resize(count);
    shortLinks_[EndCode] = 1;
    shortLinks_[NewWordCode] = 1;
    std::uint32_t code = FirstSharedCode;
    for (std::uint32_t i = 0; i < header_.hotLinks; ++i) {
        const std::uint32_t link = codes_.readFour();
        if (link >> 1 >= header_.shared) return false;
        shortLinks_[code++] = FirstLink + link;
    }
    firstNumber_ = code;
    for (; code < OneByteCodes; ++code) shortLinks_[code] = FirstLink + code - firstNumber_;
    return true;
}

inline bool DictionaryDecoder::readNode(CodeReader& codes, std::uint32_t mask) {
    const std::size_t size = 1 + 2 * std::size_t{EdgeCount(mask)};
    if (mask == 0 || mask >> Letters != 0 || size > all_ - used_) return false;
    std::uint32_t* cell = cells_ + used_;
    *cell++ = mask;
    std::uint64_t words = 0;
    std::uint32_t height = 0;
    std::uint32_t waiting = waiting_;
    for (const std::uint32_t* end = cells_ + used_ + size; cell != end;) {
        Read child{};
        std::uint32_t wordEnds = 0;
        if (!readLink(codes, waiting, child, wordEnds)) return false;
        *cell++ = child.node | (wordEnds << 31);
        *cell++ = static_cast<std::uint32_t>(words);
        words += wordEnds + child.words;
        height = std::max(height, child.height + 1);
    }
    if (words > INT32_MAX || height > LongestWord || waiting == MostWaiting) return false;
    nodes_[waiting++] = {static_cast<NodeIndex>(used_), static_cast<std::uint32_t>(words), height};
    waiting_ = waiting;
    used_ += size;
    return true;
}

// All kinds of links in one way, because which comes next cannot be foreseen.
inline bool DictionaryDecoder::readLink(CodeReader& codes, std::uint32_t& waiting, Read& child,
                                        std::uint32_t& wordEnds) {
    std::uint32_t code = 0;
    if (!codes.read(code)) return false;
    const std::uint32_t link = Choose(IsLess(code, OneByteCodes), shortLinks_[code % OneByteCodes],
                                      FirstLink + code - firstNumber_);
    const std::uint32_t isNew = IsLess(code - NewChildCode, 2);
    if (isNew > waiting || link >> 1 > shared_) return false;
    child = nodes_[Choose(isNew, waiting - 1, MostWaiting + (link >> 1))];
    waiting -= isNew;
    wordEnds = link & 1;
    return true;
}

inline bool DictionaryDecoder::share() {
    if (waiting_ == 0 || shared_ == header_.shared) return false;
    nodes_[MostWaiting + ++shared_] = nodes_[waiting_ - 1];
    return true;
}

[[gnu::flatten]] bool DictionaryDecoder::readNodes() {
    CodeReader codes = codes_;  // kept in registers here
    while (codes.left() > 0) {
        std::uint32_t code = 0;
        const bool isLong = codes.isLong();
        if (!codes.read(code)) return false;
        if (!isLong && code == ShareCode) {
            if (!share()) return false;
            continue;
        }
        if (!isLong && code - FirstMaskCode >= masks_.size()) return false;
        if (!readNode(codes, isLong ? code : masks_[code - FirstMaskCode])) return false;
    }
    return true;
}

// Exactly one node has no parent, all counts are used up, and no word has one letter only.
bool DictionaryDecoder::finished() const {
    if (used_ != all_ || shared_ != header_.shared) return false;
    if (header_.nodes == 0) return header_.words == 0 && waiting_ == 0;
    if (waiting_ != 1 || nodes_[0].words != header_.words) return false;
    const std::uint32_t* root = cells_ + nodes_[0].node;
    for (std::uint32_t i = 0; i < EdgeCount(root[0]); ++i) {
        if ((root[1 + 2 * i] & WordEnds) != 0) return false;
    }
    return true;
}
