#include "options/settings.h"

#include <quorle/word_engine.h>

#include <algorithm>
#include <charconv>
#include <optional>
#include <string>
#include <string_view>

#include "dictionary/dictionary.h"
#include "platform/platform.h"
#include "state/game_state.h"

namespace {

constexpr const char* KeyPath = "Software\\Kaldrun\\Quorle\\Default";

std::optional<std::string> ReadValue(const char* name) {
    std::string buffer = "1234567890";
    auto length = static_cast<std::int32_t>(buffer.size());
    cGetRegValue(KeyPath, name, buffer.data(), &length);
    if (length <= 0) return std::nullopt;
    return buffer.substr(0, static_cast<std::size_t>(length));
}

// None when the text is no whole number of 16 bits.
std::optional<std::int16_t> ToNumber(std::string_view text) {
    std::int16_t number = 0;
    const char* end = text.data() + text.size();
    const auto [stopped, error] = std::from_chars(text.data(), end, number);
    if (error != std::errc() || stopped != end) return std::nullopt;
    return number;
}

std::optional<std::int16_t> ReadNumber(const char* name) {
    const auto text = ReadValue(name);
    return text ? ToNumber(*text) : std::nullopt;
}

void WriteValue(const char* name, const std::string& text) {
    cSetRegValue(KeyPath, name, text.c_str(), static_cast<std::int32_t>(text.size()));
}

std::int16_t WordSizeOr(std::int16_t size, std::int16_t otherwise) {
    return size >= ShortestWord && size <= LongestWord ? size : otherwise;
}

}  // namespace

namespace Common {

void LoadSettings() {
    if (const auto seconds = ReadNumber("TimeLimit")) {
        const bool offered =
            std::find(GameTimes.begin(), GameTimes.end(), *seconds) != GameTimes.end();
        State.TimeLimit = offered ? *seconds : UsualGameTime;
    }
    if (const auto size = ReadNumber("MinWordSize")) {
        cSetMinWordSize(WordSizeOr(*size, UsualShortestWord));
    }
    if (const auto size = ReadNumber("MaxWordSize")) {
        ReconcileMaxWordSize(WordSizeOr(*size, LongestWord));
    }
    const auto sounds = ReadValue("Sounds");
    State.Sounds = ToBoolean(!sounds || *sounds == "1");
}

void SaveSettings() {
    WriteValue("TimeLimit", std::to_string(State.TimeLimit));
    WriteValue("MinWordSize", std::to_string(cMinWordSize()));
    WriteValue("MaxWordSize", std::to_string(cMaxWordSize()));
    WriteValue("Sounds", State.Sounds ? "1" : "0");
}

void ReconcileMaxWordSize(std::int16_t size) {
    if (size > cMaxWordSize()) {
        Platform::ShowMessage("WARNING - dictionary is limited to words that have no more than " +
                                  std::to_string(cMaxWordSize()) +
                                  " letters, resetting Max Word Size option",
                              Platform::ProgramTitle);
    }
    if (size >= cMaxWordSize()) return;
    const bool remove =
        Platform::AskYesNo("Dictionary contains words longer than " + std::to_string(size) +
                               " letters, is it OK to remove the longer words from the dictionary?",
                           Platform::ProgramTitle);
    if (remove) {
        Dictionary::ShortenDictionary(size);
    } else {
        Platform::ShowMessage(
            "Setting Max Word Size option to " + std::to_string(cMaxWordSize()) + " letters",
            Platform::ProgramTitle);
    }
}

}  // namespace Common
