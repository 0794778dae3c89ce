#include "settings_file.h"

#include <gtest/gtest.h>
#include <sys/wait.h>
#include <unistd.h>

#include "temp_folder.h"

namespace {

class Settings : public testing::Test {
  protected:
    Settings() { setenv("XDG_CONFIG_HOME", (home_ / "config").c_str(), 1); }

    std::string get(std::string_view key, std::string_view name) const {
        std::string value;
        return GetSetting(key, name, value) ? value : "absent";
    }
    std::string file() const { return home_.read("config/quorle/settings"); }

    TempFolder home_;
};

TEST_F(Settings, AreFoundAgainAndNeverConfused) {
    const std::pair<const char*, const char*> names[] = {
        {"a", "b=c"}, {"a=b", "c"}, {"a\\", "b"}, {"a", "\\b"}, {"[a]", "#b"},
        {"a ", "b"},  {"a", " b"},  {"A", "b"},   {"ä", "ü"},   {"Software\\Q\\Default", "x"}};
    EXPECT_EQ(get("a", "b=c"), "absent");
    for (const auto& [key, name] : names) {
        EXPECT_TRUE(SetSetting(key, name, std::string(key) + name));
    }
    for (const auto& [key, name] : names) EXPECT_EQ(get(key, name), std::string(key) + name);
    EXPECT_TRUE(SetSetting("a", "b=c", ""));
    EXPECT_EQ(get("a", "b=c"), "");
    EXPECT_EQ(std::filesystem::status(home_ / "config/quorle").permissions(),
              std::filesystem::perms::owner_all);
}

TEST_F(Settings, RefuseWhatTheFileCannotHold) {
    const std::string longest(255, 'x');
    EXPECT_TRUE(SetSetting(longest, longest, longest));
    EXPECT_EQ(get(longest, longest), longest);
    const std::string before = file();
    for (const std::string& bad : {longest + "x", std::string("a\tb"), std::string("a\nb"),
                                   std::string("a\0b", 3), std::string("\x7f")}) {
        EXPECT_FALSE(SetSetting(bad, "name", "value"));
        EXPECT_FALSE(SetSetting("key", bad, "value"));
        EXPECT_FALSE(SetSetting("key", "name", bad));
    }
    EXPECT_FALSE(SetSetting("", "name", "value"));
    EXPECT_FALSE(SetSetting("key", "", "value"));
    EXPECT_EQ(file(), before);
}

TEST_F(Settings, KeepLinesThatCannotBeUnderstood) {
    ASSERT_TRUE(SetSetting("key", "name", "old"));
    home_.write("config/quorle/settings",
                "# mine\n\nkey\tname\tto\to many\nkey\tname\t5\r\nkey\tname\tx\nkey\tnam");
    EXPECT_EQ(get("key", "name"), "x");
    EXPECT_TRUE(SetSetting("key", "name", "new"));
    EXPECT_EQ(file(),
              "# mine\n\nkey\tname\tto\to many\nkey\tname\t5\r\nkey\tname\tnew\nkey\tnam\n");
    EXPECT_TRUE(SetSetting("key", "nam", "e"));
    EXPECT_EQ(get("key", "name"), "new");
}

TEST_F(Settings, NeverCountAnUnreadableFileAsEmpty) {
    std::filesystem::create_directories(home_ / "config/quorle/settings");
    EXPECT_FALSE(SetSetting("key", "name", "value"));
    EXPECT_EQ(get("key", "name"), "absent");
    setenv("XDG_CONFIG_HOME", "relative", 1);
    setenv("HOME", home_.path().c_str(), 1);
    EXPECT_TRUE(SetSetting("key", "name", "at home"));
    EXPECT_EQ(home_.read(".config/quorle/settings"), "key\tname\tat home\n");
    unsetenv("HOME");
    EXPECT_FALSE(SetSetting("key", "name", "value"));
}

TEST_F(Settings, OfProgramsAtOnceAllSurvive) {
    constexpr int Programs = 4, Values = 25;
    for (int program = 0; program < Programs; ++program) {
        if (fork() != 0) continue;
        for (int i = 0; i < Values; ++i) {
            // Refused when the others keep the lock for too long.
            while (!SetSetting(std::to_string(program), std::to_string(i), "value")) continue;
        }
        _exit(0);
    }
    int status = 0;
    while (wait(&status) > 0) EXPECT_EQ(status, 0);
    for (int i = 0; i < Programs * Values; ++i) {
        EXPECT_EQ(get(std::to_string(i / Values), std::to_string(i % Values)), "value");
    }
}

}  // namespace
