#include "support/game_fixture.h"

#include <quorle/word_engine.h>

#include <filesystem>

#include "board/dice.h"
#include "platform/platform.h"
#include "support/boards.h"

namespace {

constexpr const char* KeyPath = "Software\\Kaldrun\\Quorle\\Default";

}  // namespace

void UseHome(const std::string& folder) {
    for (const auto& [name, below] : {std::pair("HOME", ""),
                                      {"XDG_CONFIG_HOME", "/config"},
                                      {"XDG_DATA_HOME", "/data"},
                                      {"XDG_CACHE_HOME", "/cache"},
                                      {"XDG_RUNTIME_DIR", ""}}) {
        setenv(name, (folder + below).c_str(), 1);
    }
}

GameFixture::GameFixture() {
    UseHome(folder_.path());
    std::filesystem::create_directory(folder_ / "program");
    resetProcess();
    useTestDesktop();
}

void GameFixture::resetProcess() {
    State = GameState();
    cDictionaryClear();
    cSetMinWordSize(3);
    cSetMaxWordSize(16);
}

void GameFixture::useTestDesktop() {
    Platform::WarningSound = [this] { ++warnings_; };
    Platform::Tell = [this](const std::string& text) { told_.push_back(text); };
    Platform::SteadySeconds = [this] { return seconds_; };
    Platform::ProgramFolder = [this] { return folder_ / "program"; };
    Platform::RandomNumber = [this] {
        ++drawn_;
        if (draws_.empty()) return static_cast<float>(randomness_() >> 8) * 0x1p-24F;
        const float draw = draws_.front();
        draws_.pop_front();
        return draw;
    };
}

void GameFixture::makeDictionary(const std::vector<std::string>& words, int maximum) {
    resetProcess();
    cSetMaxWordSize(maximum);
    for (const std::string& word : words) {
        if (cDictionaryAdd(word.c_str()) != 1) ADD_FAILURE() << "no word: " << word;
    }
    EXPECT_EQ(cWriteBinaryDictionary((folder_ / "program/Dictionary.dat").c_str()), 1);
    resetProcess();
}

void GameFixture::store(const std::string& name, const std::string& text) {
    cSetRegValue(KeyPath, name.c_str(), text.data(), static_cast<int>(text.size()));
}

std::string GameFixture::stored(const std::string& name) {
    std::string buffer(255, ' ');
    auto length = static_cast<std::int32_t>(buffer.size());
    cGetRegValue(KeyPath, name.c_str(), buffer.data(), &length);
    return buffer.substr(0, static_cast<std::size_t>(length));
}

void GameFixture::putOnBoard(const std::string& board) {
    for (std::int16_t k = 0; k < CubeCount; ++k) {
        Dice::PutOnBoard(k, board.at(static_cast<std::size_t>(k)));
    }
}

void GameFixture::shakeNext(const std::string& board) {
    const std::vector<float> draws = DrawsFor(board);
    draws_.assign(draws.begin(), draws.end());
}
