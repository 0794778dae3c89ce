#include "usual_way.h"

#include <algorithm>
#include <utility>

UsualWay::UsualWay(const WordList& words) {
    for (const std::string& word : words) {
        Node* node = &root_;
        for (const char letter : word) {
            auto& child = node->children[static_cast<std::size_t>(letter - 'a')];
            if (!child) child = std::make_unique<Node>();
            node = child.get();
        }
        node->isWord = true;
    }
}

std::set<std::string> UsualWay::search(const std::string& board, std::size_t minLetters) {
    minLetters_ = minLetters;
    chains_ = 0;
    found_.clear();
    for (int cube = 0; cube < 16; ++cube) follow(&root_, cube, board);
    return std::move(found_);
}

void UsualWay::follow(const Node* node, int cube, const std::string& board) {
    const char letter = board[static_cast<std::size_t>(cube)];
    const Node* child = node->children[static_cast<std::size_t>(letter - 'a')].get();
    if (child == nullptr) return;
    letters_.push_back(letter);
    if (letter == 'q') {
        // A lone "q" ends a word; nothing but "u" goes on.
        if (child->isWord && letters_.size() >= minLetters_) found_.insert(letters_);
        child = child->children['u' - 'a'].get();
        letters_.push_back('u');
    }
    if (child != nullptr) visit(child, cube, board);
    if (letter == 'q') letters_.pop_back();
    letters_.pop_back();
}

void UsualWay::visit(const Node* node, int cube, const std::string& board) {
    ++chains_;
    if (node->isWord && letters_.size() >= minLetters_) found_.insert(letters_);
    used_[static_cast<std::size_t>(cube)] = true;
    const int row = cube / 4;
    const int column = cube % 4;
    for (int r = std::max(row - 1, 0); r <= std::min(row + 1, 3); ++r) {
        for (int c = std::max(column - 1, 0); c <= std::min(column + 1, 3); ++c) {
            const int other = 4 * r + c;
            if (!used_[static_cast<std::size_t>(other)]) follow(node, other, board);
        }
    }
    used_[static_cast<std::size_t>(cube)] = false;
}
