#include "entry/check_cubes.h"

#include <algorithm>
#include <optional>
#include <vector>

namespace {

constexpr std::string_view Qu = "qu";
constexpr std::size_t LongestChainText = CubeCount * Qu.size();

// What the next cube has to show. The Qu cube also takes a "q" that ends the
// word: that is what has been typed when the "u" is still to come.
std::string_view LetterUnit(std::string_view rest) {
    if (rest == "q" || rest.starts_with(Qu)) return Qu;
    return rest.substr(0, 1);
}

bool IsLastUnit(std::string_view rest) {
    return rest.size() == 1 || rest == Qu;
}

bool TraceFrom(std::size_t fromRow, std::size_t fromColumn, std::string_view rest, BoardMarks& path,
               std::vector<std::size_t>& backwards) {
    const std::string_view unit = LetterUnit(rest);
    const std::size_t lastRow = std::min<std::size_t>(fromRow + 1, BoardSize - 1);
    const std::size_t lastColumn = std::min<std::size_t>(fromColumn + 1, BoardSize - 1);
    for (std::size_t row = fromRow - std::min<std::size_t>(fromRow, 1); row <= lastRow; ++row) {
        for (std::size_t column = fromColumn - std::min<std::size_t>(fromColumn, 1);
             column <= lastColumn; ++column) {
            Boolean& mark = path[row][column];
            if (mark || State.BoardGrid[row][column] != unit) continue;
            mark = True;
            if (IsLastUnit(rest) ||
                TraceFrom(row, column, rest.substr(unit.size()), path, backwards)) {
                backwards.push_back(BoardSize * row + column);
                return true;
            }
            mark = False;
        }
    }
    return false;
}

struct Trace {
    Boolean found;
    std::optional<BoardMarks> path;
    std::vector<std::size_t> chain;  // the path's board indexes in the word's order
};

Trace TraceWord(std::string_view word) {
    if (word.empty()) return {True, BoardMarks{}, {}};
    std::optional<BoardMarks> path;
    std::vector<std::size_t> backwards;
    const std::string_view unit = LetterUnit(word);
    for (std::size_t row = 0; row < BoardSize; ++row) {
        for (std::size_t column = 0; column < BoardSize; ++column) {
            if (State.BoardGrid[row][column] != unit) continue;
            path.emplace();
            (*path)[row][column] = True;
            if (IsLastUnit(word) ||
                TraceFrom(row, column, word.substr(unit.size()), *path, backwards)) {
                backwards.push_back(BoardSize * row + column);
                return {True, path, {backwards.rbegin(), backwards.rend()}};
            }
        }
    }
    return {False, path, {}};
}

}  // namespace

namespace CheckCubes {

Boolean IsOnBoard(std::string_view word) {
    const Trace trace = TraceWord(word);
    if (trace.path) State.TracedPath = *trace.path;
    return trace.found;
}

std::string Places(std::string_view word) {
    std::string places;
    for (const std::size_t cube : TraceWord(word).chain) {
        if (!places.empty()) places += ", ";
        places += "row " + std::to_string(cube / BoardSize + 1) + " column " +
                  std::to_string(cube % BoardSize + 1);
    }
    return places;
}

// No chain spells more than its cubes can, so a long paste is cut to that first.
std::size_t LongestOnBoard(std::string_view text) {
    std::size_t length = std::min(text.size(), LongestChainText);
    while (!IsOnBoard(text.substr(0, length))) --length;
    return length;
}

}  // namespace CheckCubes
