#include <cstdlib>
#include <fstream>

#include "dictionary_file/dictionary_file.h"
#include "rows.h"
#include "search/board_search.h"

namespace {

using namespace Quorle;

class PlainSearch {
  public:
    explicit PlainSearch(const std::string& dictionary) {
        std::ifstream file(dictionary, std::ios::binary);
        const std::string text(std::istreambuf_iterator<char>(file), {});
        if (!DecodeDictionary(std::as_bytes(std::span(text)), content_)) std::abort();
    }
    /// Calls `take` with each word, in alphabetical order.
    template <class Take>
    void search(const std::string& letters, const Take& take) {
        Board board{};
        std::copy(letters.begin(), letters.end(), board.begin());
        search_->search(content_.words, board, {}, found_);
        for (std::size_t i = 0; i < found_.size(); ++i) {
            char text[LongestWord];
            take(std::string_view(text, found_.spell(i, text)));
        }
    }

  private:
    DictionaryContent content_;
    std::unique_ptr<BoardSearch> search_ = std::make_unique<BoardSearch>(Matching::Plain);
    FoundWords found_;
};

}  // namespace

void AddPlainSearch(const Row& row, const std::vector<std::string>& boards,
                    const std::string& dictionary, const std::shared_ptr<UsualWay>& usual) {
    auto plain = std::make_shared<PlainSearch>(dictionary);
    for (std::size_t i = 0; i < std::min<std::size_t>(boards.size(), 500); ++i) {
        std::set<std::string> found;
        plain->search(boards[i], [&](std::string_view word) { found.emplace(word); });
        Require(found == usual->search(boards[i]), boards[i].c_str());
    }
    auto at = std::make_shared<std::size_t>(0);
    const auto next = [boards, at]() -> const std::string& {
        return boards[(*at)++ % boards.size()];
    };
    AddTimings(
        row, Compared::Ratio, [] {},
        [plain, next] {
            std::size_t letters = 0;
            plain->search(next(), [&](std::string_view word) { letters += word.size(); });
        },
        [usual, next] { usual->search(next()); });
}
