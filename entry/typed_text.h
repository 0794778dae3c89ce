#pragma once
// What becomes of a typed text that the board cannot spell. Texts are UTF-8.
#include <cstddef>
#include <string>
#include <string_view>

namespace Entry {

/// A text in lower case; only ASCII letters change, and only they are words.
std::string LowerCase(std::string_view text);

struct TypedCut {
    std::size_t kept;      ///< bytes that stay, from the front
    std::size_t takenOff;  ///< characters taken off the end, a warning sound each
    bool traced;           ///< the board is to be lit from TracedPath
};

/// Decides about a text just typed, and updates LastTypedText and TracedPath. What
/// the clicks have built stays untraced; anything else is cut back until it lies
/// on the board.
TypedCut CutToBoard(std::string_view text);

}  // namespace Entry
