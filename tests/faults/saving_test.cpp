// Every system call of a save fails, is cut short or is the process's last, one at a time.
#include <gtest/gtest.h>
#include <quorle/word_engine.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <cstring>

#include "engine/temp_folder.h"
#include "faulty_calls.h"

namespace {

using FaultyCalls::Fault;
using FaultyCalls::Plan;
using Names = std::set<std::string>;

/// A way to save into the file "target" of a folder.
struct Scenario {
    const char* name;
    std::int32_t (*save)(const char* path);
    const char* path;
    bool exists;
    bool damaged;
    bool noLinks;
};

constexpr Scenario Scenarios[] = {
    {"NewFile", cWriteTextFile, "target", false, false, false},
    {"OldFileThroughLink", cWriteTextFile, "link", true, false, false},
    {"Dictionary", cWriteBinaryDictionary, "target", true, false, false},
    {"DamagedDictionary", cWriteBinaryDictionary, "target", true, true, false},
    {"DamagedDictionaryWithoutLinks", cWriteBinaryDictionary, "target", true, true, true},
    {"Setting", [](const char*) { return cSetRegValue("key", "name", "value", 5); }, "", true,
     false, false},
};

auto OpenFiles() {
    return std::distance(std::filesystem::directory_iterator("/proc/self/fd"), {});
}

class Saving : public testing::TestWithParam<Scenario> {
  protected:
    Saving() {
        cDictionaryClear();
        for (const char* word : {"cat", "cats", "zebra"}) cDictionaryAdd(word);
        prepare();
        EXPECT_TRUE(save());
        new_ = folder_->read("target");
    }

    bool save() const { return GetParam().save((*folder_ / GetParam().path).c_str()) == 1; }
    bool saved() const { return folder_->read("target") == new_; }

    void prepare() {
        folder_.emplace();
        setenv("XDG_CONFIG_HOME", folder_->path().c_str(), 1);
        std::filesystem::create_symlink("target", *folder_ / "link");
        std::filesystem::create_symlink("target", *folder_ / "settings");
        std::filesystem::create_symlink(".", *folder_ / "quorle");
        if (!GetParam().exists) return;
        const std::string target = folder_->write("target", old_);
        EXPECT_TRUE(getuid() != 0 || chown(target.c_str(), 1234, 1234) == 0);
        ASSERT_EQ(chmod(target.c_str(), 0604), 0);
        if (!GetParam().damaged) return;
        folder_->write("target.damaged", "of last year");
        cReadBinaryDictionary(target.c_str());
    }

    /// The old content or the new, and nothing beside it; a damaged file is kept by a save.
    void check(const Plan& plan, const std::string& call) const {
        const bool kept = GetParam().damaged && saved();
        EXPECT_TRUE(saved() || folder_->read("target") == old_);
        EXPECT_EQ(folder_->read("target.damaged"), GetParam().damaged ? "of last year" : "");
        EXPECT_EQ(folder_->read("target.damaged.2"), kept ? old_ : "");
        EXPECT_TRUE(std::filesystem::is_symlink(*folder_ / "link"));
        EXPECT_TRUE(std::filesystem::is_symlink(*folder_ / "settings"));
        Names expected{"link", "settings", "quorle"};
        if (GetParam().exists || saved()) expected.insert("target");
        if (GetParam().damaged) expected.insert("target.damaged");
        if (kept) expected.insert("target.damaged.2");
        EXPECT_EQ(folder_->names(), expected);
        // Without links a killed save leaves the old file under its second name alone.
        const bool moved = GetParam().noLinks && plan.fault == Fault::Kill;
        if (!GetParam().exists || moved) return;
        struct stat status {};
        ASSERT_EQ(stat((*folder_ / "target").c_str(), &status), 0);
        EXPECT_EQ(status.st_mode & mode_t{07777}, 0604U);
        EXPECT_TRUE(getuid() != 0 || status.st_uid == 1234 || call == "fchown");
    }

    /// Saves under the plan, which makes that call fail, and returns the calls that were made.
    std::vector<std::string> saveWith(const Plan& plan, const std::string& call = "") {
        prepare();
        const auto before = OpenFiles();
        bool done = false;
        const auto calls = FaultyCalls::During(plan, [&] { done = save(); });
        EXPECT_EQ(OpenFiles(), before);
        check(plan, call);
        // When the folder's sync has failed only whether the new content is on the disk is not
        // known.
        const bool folderSync = call == "fsync" && std::ranges::count(calls, "renameat") > 0;
        EXPECT_EQ(done || folderSync, saved());
        const Names fatal{"write", "fsync", "renameat", "fchmod"};
        const Names repeated{"openat", "read", "write", "fsync", "flock", "close"};
        const bool succeeds =
            plan.fault != Fault::Error || (plan.error == EINTR && repeated.count(call) == 1);
        EXPECT_TRUE(succeeds ? done : !done || fatal.count(call) == 0);
        EXPECT_TRUE(!done || save());
        check(plan, call);  // a damaged file is kept once
        return calls;
    }

    /// Kills the save there, again and again; the next save then cleans up.
    void killAt(Plan plan) {
        prepare();
        for (int kill = 0; kill < 2 && !saved(); ++kill) {
            if (fork() == 0) {
                FaultyCalls::During(plan, [this] { save(); });
                _exit(0);
            }
            int status = 0;
            wait(&status);
            EXPECT_TRUE(WIFSIGNALED(status) || kill > 0);
        }
        const Names ours{".quorle-save", "link",           "quorle",          "settings",
                         "target",       "target.damaged", "target.damaged.2"};
        EXPECT_TRUE(std::ranges::includes(ours, folder_->names()));
        plan.number = 0;
        if (!saved()) FaultyCalls::During(plan, [this] { EXPECT_TRUE(save()); });
        check(plan, "");
    }

    const std::string old_ = GetParam().exists ? "old words, none of them a dictionary" : "";
    std::string new_;
    std::optional<TempFolder> folder_;
};

TEST_P(Saving, SurvivesEveryFault) {
    Plan plan{GetParam().noLinks};
    std::string order;
    for (const std::string& call : saveWith(plan)) {
        SCOPED_TRACE(call + ", call " + std::to_string(++plan.number));
        plan.fault = Fault::Error;
        for (const int error : {ENOSPC, EIO, EDQUOT, EACCES, EINTR}) {
            SCOPED_TRACE(strerror(plan.error = error));
            saveWith(plan, call);
        }
        plan.fault = Fault::Kill;
        killAt(plan);
        plan.fault = Fault::Short;
        if (call == "read" || call == "write") saveWith(plan);
        if (call == "write" || call == "fsync" || call == "renameat") order += call + " ";
    }
    EXPECT_NE(order.find("write fsync renameat "), order.npos);
    EXPECT_TRUE(order.ends_with("renameat fsync "));
}

INSTANTIATE_TEST_SUITE_P(Scenarios, Saving, testing::ValuesIn(Scenarios),
                         [](const auto& each) { return std::string(each.param.name); });

}  // namespace
