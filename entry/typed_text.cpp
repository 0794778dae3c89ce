#include "entry/typed_text.h"

#include <algorithm>

#include "entry/check_cubes.h"
#include "state/game_state.h"

namespace {

// Code points.
std::size_t CharacterCount(std::string_view text) {
    return static_cast<std::size_t>(std::count_if(text.begin(), text.end(), [](char c) {
        return (static_cast<unsigned char>(c) & 0xC0U) != 0x80U;  // not a continuation byte
    }));
}

std::size_t FirstCharacterSize(std::string_view text) {
    std::size_t size = 1;
    while (size < text.size() && CharacterCount(text.substr(0, size + 1)) == 1) ++size;
    return size;
}

}  // namespace

std::string Entry::LowerCase(std::string_view text) {
    std::string lower(text);
    std::transform(lower.begin(), lower.end(), lower.begin(), [](char c) {
        return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c;
    });
    return lower;
}

Entry::TypedCut Entry::CutToBoard(std::string_view text) {
    State.LastTypedText = text;
    if (State.PickedWord == LowerCase(text)) return {text.size(), 0, false};
    const std::size_t kept = CheckCubes::LongestOnBoard(text);
    // An empty text is never noted: the one before it, of one character, stays.
    if (kept > 0) {
        State.LastTypedText = text.substr(0, kept);
    } else {
        State.LastTypedText = text.substr(0, FirstCharacterSize(text));
    }
    return {kept, CharacterCount(text.substr(kept)), true};
}
