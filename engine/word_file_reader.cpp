#include "word_file_reader.h"

#include <fcntl.h>
#include <sys/stat.h>

#include <algorithm>

#include "read_file.h"

namespace {

constexpr std::size_t BlockSize = std::size_t{16} << 10;

/// Fills `block` as far as the file goes; false when it cannot be read.
bool ReadBlock(int file, std::span<std::byte> block, std::size_t& used) {
    for (used = 0; used < block.size();) {
        const ssize_t got =
            RepeatInterrupted([&] { return read(file, block.data() + used, block.size() - used); });
        if (got < 0) return false;
        if (got == 0) return true;
        used += static_cast<std::size_t>(got);
    }
    return true;
}

std::span<const std::byte> WithoutByteOrderMark(std::span<const std::byte> text) {
    constexpr std::byte Mark[] = {std::byte{0xEF}, std::byte{0xBB}, std::byte{0xBF}};
    const bool marked =
        text.size() >= 3 && std::equal(std::begin(Mark), std::end(Mark), text.begin());
    return text.subspan(marked ? 3 : 0);
}

}  // namespace

bool WordFileReader::open(const char* path) {
    file_ = OpenRegularFile(AT_FDCWD, path);
    struct stat status {};
    if (!file_ || fstat(file_.number(), &status) != 0) return false;
    size_ = left_ = static_cast<std::size_t>(status.st_size);
    block_.resize(BlockSize);
    return true;
}

WordFileReader::Progress WordFileReader::readOn() {
    if (words_.crowded()) {
        words_.relieve();
        return Progress::Reading;
    }
    std::size_t used = 0;
    const std::span<std::byte> block = std::span(block_).first(std::min(left_, BlockSize));
    if (!ReadBlock(file_.number(), block, used)) return Progress::Failed;
    std::span<const std::byte> text = block.first(used);
    if (left_ == size_) text = WithoutByteOrderMark(text);
    tokens_.read(text, [this](PackedWord word) { words_.add(word); });
    left_ -= used;
    if (left_ > 0 && used == block.size()) return Progress::Reading;
    return finish();
}

/// A word that was written on beyond the end since the file was opened is taken whole.
WordFileReader::Progress WordFileReader::finish() {
    const auto add = [this](PackedWord word) { words_.add(word); };
    std::size_t used = 0;
    if (tokens_.inToken()) {
        const auto rest = std::span(block_).first(MaxPackedLetters);
        if (!ReadBlock(file_.number(), rest, used)) return Progress::Failed;
        for (std::size_t i = 0; i < used && tokens_.inToken(); ++i) {
            tokens_.read(rest.subspan(i, 1), add);
        }
    }
    tokens_.end(add);
    words_.finish();
    return Progress::Done;
}

double WordFileReader::fraction() const {
    return size_ == 0 ? 1 : 1 - static_cast<double>(left_) / static_cast<double>(size_);
}
