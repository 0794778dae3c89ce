#include "support/game_fixture.h"

#include "engine/calls.h"

namespace {

constexpr const char* KeyPath = "Software\\Kaldrun\\Quorle\\Default";

}  // namespace

void UseHome(const std::string& folder) {
    for (const char* name :
         {"HOME", "XDG_CONFIG_HOME", "XDG_DATA_HOME", "XDG_CACHE_HOME", "XDG_RUNTIME_DIR"}) {
        setenv(name, folder.c_str(), 1);
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
        if (draws_.empty()) return static_cast<float>(randomness_() >> 8) * 0x1p-24F;
        const float draw = draws_.front();
        draws_.pop_front();
        return draw;
    };
}

void GameFixture::makeDictionary(const std::vector<std::string>& words, int maximum) {
    resetProcess();
    cSetMaxWordSize(maximum);
    for (const std::string& word : words) EXPECT_EQ(cDictionaryAdd(word.c_str()), 1) << word;
    EXPECT_EQ(cWriteBinaryDictionary((folder_ / "program/Dictionary.dat").c_str()), 1);
}

int GameFixture::wordsInFile() const {
    EXPECT_EQ(cReadBinaryDictionary((folder_ / "program/Dictionary.dat").c_str()), 1);
    return cNumberOfWords();
}

void GameFixture::store(const std::string& name, const std::string& text) {
    cSetRegValue(KeyPath, name.c_str(), text.data(), static_cast<int>(text.size()));
}

std::string GameFixture::stored(const std::string& name) {
    const std::string value = Setting(KeyPath, name);
    return value == "absent" ? "" : value;
}
