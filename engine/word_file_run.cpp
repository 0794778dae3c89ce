#include "word_file_run.h"

namespace {

/// How many letters two different words have in common at their beginning, 0..15.
std::size_t SharedLetters(PackedWord a, PackedWord b) {
    const PackedWord difference = a ^ b;
    const auto high = static_cast<std::uint64_t>(difference >> 64);
    const auto low = static_cast<std::uint64_t>(difference);
    const int same = high != 0 ? std::countl_zero(high) : 64 + std::countl_zero(low);
    return static_cast<std::size_t>(same) / 8 % MaxPackedLetters;
}

}  // namespace

bool WordRun::Cursor::nextBlock() {
    if (run_ == nullptr || block_ == run_->blocks_.size()) return false;
    const Block& block = run_->blocks_[block_++];
    at_ = block.bytes.get();
    end_ = at_ + block.used;
    return true;
}

void WordRun::append(PackedWord word) {
    const bool anew = blocks_.empty() || blocks_.back().used + Room > BlockSize;
    if (anew) blocks_.push_back({std::make_unique_for_overwrite<std::byte[]>(BlockSize), 0});
    const std::size_t shared = anew ? 0 : SharedLetters(last_, word);
    const std::size_t fresh = LengthOf(word) - shared;
    Block& block = blocks_.back();
    std::byte* const at = block.bytes.get() + block.used;
    *at = static_cast<std::byte>(shared << 4 | (fresh - 1));
    StoreBytes(word << 8 * shared, at + 1);
    block.used += 1 + fresh;
    last_ = word;
    ++size_;
}
