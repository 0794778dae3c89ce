// How files are written: text files and settings.
#include <fcntl.h>
#include <gtest/gtest.h>
#include <sys/file.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>

#include "engine/calls.h"
#include "engine/temp_folder.h"

namespace {

using Names = std::set<std::string>;

class Files : public testing::Test {
  protected:
    Files() {
        cDictionaryClear();
        cDictionaryAdd("cat");
        setenv("XDG_CONFIG_HOME", folder_.path().c_str(), 1);
    }
    bool save(const std::string& name) const {
        return cWriteTextFile((folder_ / name).c_str()) == 1;
    }
    static bool set(const std::string& key, const std::string& name, const std::string& value) {
        return cSetRegValue(key.c_str(), name.c_str(), value.data(), int(value.size())) == 1;
    }
    TempFolder folder_;
};

TEST_F(Files, AreWrittenThroughDanglingLinksButOnlyWhenAndWhereTheyMayBe) {
    std::filesystem::create_directory(folder_ / "sub");
    std::filesystem::create_symlink("sub/second", folder_ / "first");
    std::filesystem::create_symlink("../target", folder_ / "sub/second");
    std::filesystem::create_symlink("loop", folder_ / "loop");
    std::filesystem::create_symlink("/dev/zero", folder_ / "device");
    ASSERT_EQ(mkfifo((folder_ / "pipe").c_str(), 0600), 0);
    const mode_t mask = umask(0027);
    EXPECT_TRUE(save("first"));
    umask(mask);
    folder_.write(".quorle-save", "1,no-temporary-file");
    EXPECT_EQ(static_cast<int>(std::filesystem::status(folder_ / "target").permissions()), 0640);
    const Names before = folder_.names();
    const int otherSaver = open(folder_.path().c_str(), O_RDONLY | O_DIRECTORY);
    ASSERT_EQ(flock(otherSaver, LOCK_EX), 0);
    EXPECT_FALSE(save("first"));
    close(otherSaver);
    for (const char* name :
         {"sub", "pipe", "loop", "device", "sub/", "sub/..", "", "missing/file", ".quorle-save"}) {
        SCOPED_TRACE(name);
        EXPECT_FALSE(save(name));
        EXPECT_EQ(cReadBinaryDictionary((folder_ / name).c_str()), 0);
        EXPECT_EQ(cReadTextFile((folder_ / name).c_str()), 100);
    }
    EXPECT_EQ(folder_.names(), before);
    EXPECT_TRUE(save("first"));
    EXPECT_EQ(folder_.read("target"), "cat\n");  // what cannot be read has changed nothing
}

TEST_F(Files, OfSettingsKeepEveryValueAndForeignLine) {
    const std::string longest(255, 'x');
    const std::pair<std::string, std::string> names[] = {
        {"a", "b=c"}, {"a=b", "c"}, {"a\\", "b"}, {"a", "\\b"},       {"[a]", "#b"},
        {"a ", "b"},  {"a", "b"},   {"A", "b"},   {longest, longest}, {"ä", "ü"}};
    const auto value = [](auto& key, auto& name) { return (name + key).substr(0, 255); };
    for (const auto& [key, name] : names) EXPECT_TRUE(set(key, name, value(key, name)));
    for (const auto& [key, name] : names) EXPECT_EQ(Setting(key, name), value(key, name));
    EXPECT_EQ(Setting("b", "a"), "absent");
    for (const std::string& bad : {longest + "x", std::string("a\tb"), std::string("\n")}) {
        EXPECT_FALSE(set(bad, "name", "value") || set("key", bad, "value") || set("k", "n", bad));
    }
    folder_.write("quorle/settings", "# mine\n\nk\tn\to\tmany\nk\tn\t5\r\nk\tn\tx\nk\tna");
    EXPECT_EQ(Setting("k", "n"), "x");
    EXPECT_TRUE(set("k", "n", ""));
    EXPECT_EQ(folder_.read("quorle/settings"),
              "# mine\n\nk\tn\to\tmany\nk\tn\t5\r\nk\tn\t\nk\tna\n");
    EXPECT_EQ(Setting("k", "n"), "");
    std::filesystem::remove(folder_ / "quorle/settings");
    std::filesystem::create_directory(folder_ / "quorle/settings");
    EXPECT_FALSE(set("key", "name", "value"));  // unreadable is not empty
    setenv("XDG_CONFIG_HOME", "relative", 1);
    setenv("HOME", (folder_ / "home").c_str(), 1);
    EXPECT_TRUE(set("key", "name", "at home"));
    EXPECT_EQ(folder_.read("home/.config/quorle/settings"), "key\tname\tat home\n");
}

TEST_F(Files, OfSettingsHoldTheValuesOfProgramsAtOnce) {
    for (int program = 0; program < 100; ++program) {
        if (fork() != 0) continue;
        while (!set("key", std::to_string(program), "value")) continue;  // locked for too long
        _exit(0);
    }
    while (wait(nullptr) > 0) continue;
    EXPECT_EQ(std::ranges::count(folder_.read("quorle/settings"), '\n'), 100);
}

}  // namespace
