#include "support/game_fixture.h"

#include "board/dice.h"

namespace {

constexpr const char* KeyPath = "Software\\Kaldrun\\Quorle\\Default";

// The numbers that draw a cube for each letter of the board, then its face.
bool Draw(const std::string& board, std::vector<std::string> cubes, std::deque<float>& draws) {
    if (draws.size() == 2 * CubeCount) return true;
    const auto left = cubes.size();
    for (std::size_t cube = 0; cube < left; ++cube) {
        const auto face = cubes[cube].find(board.at(CubeCount - left));
        if (face == std::string::npos) continue;
        std::vector<std::string> others = cubes;
        others.erase(others.begin() + static_cast<int>(cube));
        draws.push_back((static_cast<float>(cube) + 0.5F) / static_cast<float>(left));
        draws.push_back((static_cast<float>(face) + 0.5F) / 6);
        if (Draw(board, others, draws)) return true;
        draws.resize(draws.size() - 2);
    }
    return false;
}

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
    draws_.clear();
    const auto& cubes = State.CubeFaces;
    EXPECT_TRUE(Draw(board, {cubes.begin(), cubes.end()}, draws_)) << "no shake gives " << board;
}
