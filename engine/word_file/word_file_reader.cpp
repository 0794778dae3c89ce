#include "word_file/word_file_reader.h"

#include <fcntl.h>

#include "files/read_file.h"
#include "word_file/word_text.h"

namespace Quorle {

namespace {

constexpr std::size_t BlockSize = std::size_t{16} << 10;
// Of a token that lies across blocks no more is kept: it is no word, however it goes on.
constexpr std::size_t MostKept = LongestWord + 1;

bool HasByteOrderMark(const std::vector<std::byte>& text) {
    return text[0] == std::byte{0xEF} && text[1] == std::byte{0xBB} && text[2] == std::byte{0xBF};
}

}  // namespace

bool WordFileReader::open(const char* path) {
    file_ = OpenRegularFile(AT_FDCWD, path, size_);
    left_ = size_;
    text_.resize(MostKept + BlockSize + LongestWord);
    return static_cast<bool>(file_);
}

void WordFileReader::rewind() {
    lseek(file_.number(), 0, SEEK_SET);
    left_ = size_;
    used_ = 0;
}

WordFileReader::Progress WordFileReader::readOn() {
    const std::size_t size = std::min(left_, BlockSize);
    std::size_t got = 0;
    if (!ReadOn(file_.number(), text_.data() + used_, size, got)) return Progress::Failed;
    if (left_ == size_ && got >= 3 && HasByteOrderMark(text_)) {
        std::fill_n(text_.begin(), 3, std::byte{' '});
    }
    used_ += got;
    readWords();
    left_ -= got;
    if (left_ > 0 && got == size) return Progress::Reading;
    // A word that was written on beyond the end since the file was opened is taken whole.
    if (used_ > 0) {
        if (!ReadOn(file_.number(), text_.data() + used_, MostKept, got)) {
            return Progress::Failed;
        }
        std::byte* const rest = text_.data() + used_;
        std::byte* const space = std::find_if(rest, rest + got, IsSpace);
        *space = std::byte{' '};
        used_ = static_cast<std::size_t>(space + 1 - text_.data());
        readWords();
    }
    words_.endChunk();
    return Progress::Done;
}

/// Takes in the words of the text, and keeps the token that it ends within.
void WordFileReader::readWords() {
    std::byte* const end = text_.data() + used_;
    *end = std::byte{0};
    const std::byte* const token =
        ReadWords(text_.data(), end, [this](PackedWord word) { words_.add(word); });
    used_ = std::min(static_cast<std::size_t>(end - token), MostKept);
    std::copy_n(token, used_, text_.data());
}

double WordFileReader::fraction() const {
    return size_ == 0 ? 1 : 1 - static_cast<double>(left_) / static_cast<double>(size_);
}

}  // namespace Quorle
