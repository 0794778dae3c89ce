#pragma once
// What most programs would do: a trie of pointers, a recursive search, a set of results.
#include <array>
#include <memory>
#include <set>
#include <string>

#include "inputs.h"

class UsualWay {
  public:
    explicit UsualWay(const WordList& words);

    /// All words of at least `minLetters` on the board.
    std::set<std::string> search(const std::string& board, std::size_t minLetters = 3);
    /// How many chains of cubes the last search followed.
    long chains() const { return chains_; }

  private:
    struct Node {
        std::array<std::unique_ptr<Node>, 26> children;
        bool isWord = false;
    };

    void follow(const Node* node, int cube, const std::string& board);
    void visit(const Node* node, int cube, const std::string& board);

    Node root_;
    std::set<std::string> found_;
    std::string letters_;
    std::array<bool, 16> used_{};
    std::size_t minLetters_ = 3;
    long chains_ = 0;
};
