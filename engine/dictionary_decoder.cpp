#include "dictionary_decoder.h"

#include <algorithm>

// Links lead to nodes read before, so there are no cycles; words and heights add up as the nodes
// come, so no walk of the finished graph is needed to know that it is sound.

inline std::uint32_t CodeReader::readFour() {
    std::uint32_t value = 0;
    for (int i = 0; i < 4; ++i) value |= std::to_integer<std::uint32_t>(*at_++) << (8 * i);
    return value;
}

inline bool CodeReader::read(std::uint32_t& code) {
    if (at_ == end_) return false;
    const auto first = std::to_integer<std::uint32_t>(*at_++);
    if (first < OneByteCodes) {
        code = first;
        return true;
    }
    if (first < LongCode) {
        if (at_ == end_) return false;
        code =
            OneByteCodes + ((first - OneByteCodes) << 8) + std::to_integer<std::uint32_t>(*at_++);
        return true;
    }
    if (end_ - at_ < 4) return false;
    code = readFour();
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
    readTables();
    if (!readNodes() || !finished()) return nullptr;
    store_->closeBase(header_.nodes == 0 ? NoNode : waiting_[0].node);
    return std::move(store_);
}

// The counts against the bytes there are, before any memory is asked for.
bool DictionaryDecoder::plausible() const {
    const std::size_t bytes = codes_.left();
    const std::size_t tables = 4 * (std::size_t{header_.masks} + header_.hotLinks);
    return header_.masks <= MostMasks && header_.hotLinks <= MostHotLinks && tables <= bytes &&
           std::size_t{header_.nodes} + header_.edges + header_.shared <= bytes - tables;
}

void DictionaryDecoder::readTables() {
    masks_.resize(header_.masks);
    for (std::uint32_t& mask : masks_) mask = codes_.readFour();
    hotLinks_.resize(header_.hotLinks);
    for (std::uint32_t& link : hotLinks_) link = codes_.readFour();
    shared_.resize(header_.shared);
}

inline bool DictionaryDecoder::readNode(CodeReader& codes, std::uint32_t mask) {
    const std::size_t size = 1 + 2 * std::size_t{EdgeCount(mask)};
    if (mask == 0 || mask >> Letters != 0 || size > all_ - used_) return false;
    std::uint32_t* cell = cells_ + used_;
    *cell++ = mask;
    std::uint64_t words = 0;
    std::uint32_t height = 0;
    for (const std::uint32_t* end = cells_ + used_ + size; cell != end;) {
        Read child{};
        std::uint32_t wordEnds = 0;
        if (!readLink(codes, child, wordEnds)) return false;
        *cell++ = child.node | (wordEnds << 31);
        *cell++ = static_cast<std::uint32_t>(words);
        words += wordEnds + child.words;
        height = std::max(height, child.height + 1);
    }
    if (words > INT32_MAX || height > LongestWord || waitingCount_ == MostWaiting) return false;
    waiting_[waitingCount_++] = {static_cast<NodeIndex>(used_), static_cast<std::uint32_t>(words),
                                 height};
    used_ += size;
    return true;
}

inline bool DictionaryDecoder::readLink(CodeReader& codes, Read& child, std::uint32_t& wordEnds) {
    std::uint32_t code = 0;
    if (!codes.read(code)) return false;
    if (code == EndCode) {
        wordEnds = 1;
        return true;
    }
    if (code < FirstSharedCode) {
        wordEnds = code - NewChildCode;
        if (waitingCount_ == 0) return false;
        child = waiting_[--waitingCount_];
        return true;
    }
    code -= FirstSharedCode;
    code = code < hotLinks_.size() ? hotLinks_[code]
                                   : code - static_cast<std::uint32_t>(hotLinks_.size());
    wordEnds = code & 1;
    if (code >> 1 >= sharedCount_) return false;
    child = shared_[code >> 1];
    return true;
}

inline bool DictionaryDecoder::share() {
    if (waitingCount_ == 0 || sharedCount_ == shared_.size()) return false;
    shared_[sharedCount_++] = waiting_[waitingCount_ - 1];
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
    if (used_ != all_ || sharedCount_ != shared_.size()) return false;
    if (header_.nodes == 0) return header_.words == 0 && waitingCount_ == 0;
    if (waitingCount_ != 1 || waiting_[0].words != header_.words) return false;
    const std::uint32_t* root = cells_ + waiting_[0].node;
    for (std::uint32_t i = 0; i < EdgeCount(root[0]); ++i) {
        if ((root[1 + 2 * i] & WordEnds) != 0) return false;
    }
    return true;
}
