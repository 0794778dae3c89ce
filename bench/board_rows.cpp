#include <algorithm>
#include <chrono>
#include <memory>

#include "hard_board.h"
#include "quorle/word_engine.h"
#include "rows.h"
#include "table.h"
#include "usual_way.h"

namespace {

std::size_t FetchAll(const std::string& board) {
    const int count = cCheckForAllDefinedWords(board.c_str());
    char word[16];
    int n = 0;
    std::size_t letters = 0;
    for (int i = 0; i < count; ++i) {
        cGetDefinedWord(i, word, &n);
        letters += static_cast<std::size_t>(n) + static_cast<unsigned char>(word[0]);
    }
    return letters;
}

std::set<std::string> Found(const std::string& board) {
    std::set<std::string> words;
    const int count = cCheckForAllDefinedWords(board.c_str());
    for (int i = 0; i < count; ++i) {
        char word[16];
        int n = 0;
        cGetDefinedWord(i, word, &n);
        words.emplace(word, static_cast<std::size_t>(n));
    }
    return words;
}

/// One board after the other, over and over.
class Boards {
  public:
    explicit Boards(std::vector<std::string> boards) : boards_(std::move(boards)) {}
    const std::string& next() { return boards_[next_++ % boards_.size()]; }

  private:
    std::vector<std::string> boards_;
    std::size_t next_ = 0;
};

void AddSearches(const Row& row, const std::vector<std::string>& boards,
                 const std::string& dictionary, const std::shared_ptr<UsualWay>& usual, bool fetch,
                 int calls = 0) {
    cReadBinaryDictionary(dictionary.c_str());
    for (std::size_t i = 0; i < std::min<std::size_t>(boards.size(), 500); ++i) {
        Require(Found(boards[i]) == usual->search(boards[i]), boards[i].c_str());
    }
    auto ours = std::make_shared<Boards>(boards);
    auto theirs = std::make_shared<Boards>(boards);
    AddTimings(
        row, Compared::Ratio, [dictionary] { cReadBinaryDictionary(dictionary.c_str()); },
        [ours, fetch] {
            if (fetch) {
                FetchAll(ours->next());
            } else {
                cCheckForAllDefinedWords(ours->next().c_str());
            }
        },
        [theirs, usual] { usual->search(theirs->next()); }, calls);
}

/// The median of searches each of which finds the caches full of something else.
double ColdSearch(const std::vector<std::string>& boards) {
    std::vector<unsigned char> other(64U << 20);
    std::vector<double> times;
    for (std::size_t i = 0; i < 21; ++i) {
        for (std::size_t at = 0; at < other.size(); at += 64) ++other[at];
        const auto begin = std::chrono::steady_clock::now();
        cCheckForAllDefinedWords(boards[i].c_str());
        const std::chrono::duration<double, std::milli> time =
            std::chrono::steady_clock::now() - begin;
        times.push_back(time.count());
    }
    std::sort(times.begin(), times.end());
    return times[times.size() / 2];
}

}  // namespace

void AddBoardRows(const WordList& words) {
    const std::string dictionary = DictionaryOf("huge", words);
    const auto usual = std::make_shared<UsualWay>(words);
    const auto boards = RandomBoards(10000);
    cReadBinaryDictionary(dictionary.c_str());
    const std::string mostWords =
        HardestBoard([](const std::string& b) { return cCheckForAllDefinedWords(b.c_str()); });
    const std::string mostChains = HardestBoard([&](const std::string& b) {
        usual->search(b);
        return usual->chains();
    });
    AddFigure({"one search with cold caches", "a millisecond", "under 1 ms", "under 0.05 ms"},
              Rounded(ColdSearch(boards), " ms"));
    const std::string way = "the usual way";
    AddSearches({"random board, all words fetched", way, "18 ×", "24 ×"}, boards, dictionary, usual,
                true);
    AddSearches({"random board, count only", way, "20 ×", "30 ×"}, boards, dictionary, usual,
                false);
    AddSearches({"board of most words (" + mostWords + "), fetched", way, "12 ×", "20 ×"},
                {mostWords}, dictionary, usual, true);
    AddSearches({"board of most chains (" + mostChains + "), fetched", way, "12 ×", "20 ×"},
                {mostChains}, dictionary, usual, true);
    AddSearches({"boards of one and two letters, fetched", way, "7 ×", "12 ×"}, FewLetterBoards(),
                dictionary, usual, true);
    const std::string plain = ", without AVX2";
    AddPlainSearch({"random board, fetched" + plain, way, "", ""}, boards, dictionary, usual);
    AddPlainSearch({"board of most words, fetched" + plain, way, "", ""}, {mostWords}, dictionary,
                   usual);
    AddPlainSearch({"board of most chains, fetched" + plain, way, "", ""}, {mostChains}, dictionary,
                   usual);
    AddPlainSearch({"boards of one and two letters, fetched" + plain, way, "", ""},
                   FewLetterBoards(), dictionary, usual);
    AddSearches({"board of one letter, dictionary of its runs, fetched", way, "50 ×", "200 ×"},
                {std::string(16, 'a')}, DictionaryOf("runs", Runs()),
                std::make_shared<UsualWay>(Runs()), true, 1);
}
