#include "replace_file.h"

#include <fcntl.h>
#include <gtest/gtest.h>
#include <sys/file.h>
#include <sys/stat.h>
#include <sys/wait.h>

#include "damaged_file.h"
#include "read_file.h"
#include "temp_folder.h"

namespace {

using Names = std::set<std::string>;

bool Save(const std::string& path, const std::string& text) {
    return ReplaceFile(path.c_str(), std::as_bytes(std::span(text)));
}

mode_t ModeOf(const std::string& path) {
    struct stat status {};
    EXPECT_EQ(stat(path.c_str(), &status), 0);
    return status.st_mode & mode_t{07777};
}

TEST(ReplaceFile, KeepsModeAndReplacesTheContentWhole) {
    const TempFolder folder;
    const mode_t mask = umask(0027);
    EXPECT_TRUE(Save(folder / "file", "a long first content"));
    umask(mask);
    EXPECT_EQ(ModeOf(folder / "file"), 0640U);
    ASSERT_EQ(chmod((folder / "file").c_str(), 0604), 0);
    folder.write(".quorle-save", "left by a killed save");
    EXPECT_TRUE(Save(folder / "file", "short"));
    EXPECT_EQ(ModeOf(folder / "file"), 0604U);
    EXPECT_EQ(folder.read("file"), "short");
    EXPECT_TRUE(Save(folder / "file", ""));
    EXPECT_EQ(folder.read("file"), "");
    EXPECT_EQ(folder.names(), Names{"file"});
}

TEST(ReplaceFile, FollowsLinksToTheLastTarget) {
    const TempFolder folder;
    std::filesystem::create_directory(folder / "sub");
    std::filesystem::create_symlink("sub/second", folder / "first");
    std::filesystem::create_symlink("../target", folder / "sub/second");
    EXPECT_TRUE(Save(folder / "first", "through a dangling link"));
    EXPECT_EQ(folder.read("target"), "through a dangling link");
    EXPECT_TRUE(Save(folder / "first", "again"));
    EXPECT_EQ(folder.read("target"), "again");
    EXPECT_TRUE(std::filesystem::is_symlink(folder / "first"));
    EXPECT_TRUE(std::filesystem::is_symlink(folder / "sub/second"));
    EXPECT_EQ(folder.names(), (Names{"first", "sub", "target"}));
}

TEST(ReplaceFile, LeavesAloneWhatIsNoRegularFile) {
    const TempFolder folder;
    std::filesystem::create_directory(folder / "folder");
    ASSERT_EQ(mkfifo((folder / "pipe").c_str(), 0600), 0);
    std::filesystem::create_symlink("loop", folder / "loop");
    std::filesystem::create_symlink("/dev/null", folder / "device");
    folder.write(".quorle-save", "no temporary file of ours");
    const Names before = folder.names();
    for (const char* name : {"folder", "pipe", "loop", "device", "folder/", "folder/..", "",
                             "missing/file", ".quorle-save", ".Quorle-Save"}) {
        EXPECT_FALSE(Save(folder / name, "text")) << name;
    }
    EXPECT_FALSE(Save("", "text"));
    EXPECT_EQ(folder.names(), before);
}

TEST(ReplaceFile, WaitsForAnotherSaverAndGivesUp) {
    const TempFolder folder;
    folder.write("file", "old");
    FileDescriptor other(open(folder.path().c_str(), O_RDONLY | O_DIRECTORY));
    ASSERT_EQ(flock(other.number(), LOCK_EX), 0);
    EXPECT_FALSE(Save(folder / "file", "new"));
    EXPECT_EQ(folder.read("file"), "old");
    const pid_t holder = fork();
    if (holder == 0) {
        usleep(100'000);
        _exit(0);  // the lock goes with the last holder of the open folder
    }
    EXPECT_TRUE(other.close());
    EXPECT_TRUE(Save(folder / "file", "new"));
    waitpid(holder, nullptr, 0);
    EXPECT_EQ(folder.read("file"), "new");
}

TEST(ReplaceFile, KeepsADamagedFileOnce) {
    const TempFolder folder;
    folder.write("good", "good");
    folder.write("Dictionary.dat", "broken");
    folder.write("Dictionary.dat.damaged", "broken last year");
    RememberDamaged((folder / "Dictionary.dat").c_str());
    RememberDamaged((folder / "missing").c_str());
    EXPECT_TRUE(Save(folder / "good", "better"));
    std::filesystem::create_symlink(folder.path(), folder / "link");
    EXPECT_TRUE(Save(folder / "link/Dictionary.dat", "new"));
    EXPECT_TRUE(Save(folder / "Dictionary.dat", "newer"));
    EXPECT_EQ(folder.read("Dictionary.dat"), "newer");
    EXPECT_EQ(folder.read("Dictionary.dat.damaged"), "broken last year");
    EXPECT_EQ(folder.read("Dictionary.dat.damaged.2"), "broken");
    EXPECT_EQ(folder.names(), (Names{"good", "link", "Dictionary.dat", "Dictionary.dat.damaged",
                                     "Dictionary.dat.damaged.2"}));
}

TEST(ReadRegularFile, ReadsRegularFilesOnly) {
    const TempFolder folder;
    const std::string large(100'000, 'x');
    folder.write("large", large);
    folder.write("empty", "");
    ASSERT_EQ(mkfifo((folder / "pipe").c_str(), 0600), 0);
    std::vector<std::byte> content;
    EXPECT_TRUE(ReadRegularFile("/proc/self/status", content));  // says it has no bytes
    EXPECT_GT(content.size(), 100U);
    EXPECT_TRUE(ReadRegularFile((folder / "large").c_str(), content));
    EXPECT_EQ(content.size(), large.size());
    EXPECT_TRUE(ReadRegularFile((folder / "empty").c_str(), content));
    EXPECT_TRUE(content.empty());
    for (const auto& path : {folder / "pipe", folder / "none", folder / "", {"/dev/zero"}}) {
        EXPECT_FALSE(ReadRegularFile(path.c_str(), content)) << path;
    }
}

}  // namespace
