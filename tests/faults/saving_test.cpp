// Every system call of a save fails, is cut short or is the process's last, one at a time.
#include <gtest/gtest.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cstring>
#include <iostream>

#include "faulty_calls.h"
#include "quorle/word_engine.h"
#include "tests/engine/temp_folder.h"

namespace {

using FaultyCalls::Fault;
using FaultyCalls::Plan;
using Names = std::set<std::string>;

constexpr const char* Old = "old words, none of them a dictionary";
const Names Links{"link", "settings", "quorle"};  // all of them to "target" and its folder

std::int32_t SaveSetting(const char*) {
    return cSetRegValue("key", "name", "value", 5);
}

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
    {"Setting", SaveSetting, "", true, false, false},
};

int OpenFiles() {
    const std::filesystem::directory_iterator all("/proc/self/fd");
    return static_cast<int>(std::distance(begin(all), end(all)));
}

class Saving : public testing::TestWithParam<Scenario> {
  protected:
    Saving() {
        cDictionaryClear();
        for (const char* word : {"cat", "cats", "zebra"}) cDictionaryAdd(word);
        const TempFolder folder;
        prepare(folder);
        EXPECT_TRUE(save(folder));
        new_ = folder.read("target");
        EXPECT_NE(new_, old());
    }
    /// Saves under the plan, checks what is there afterwards and returns the calls that were made.
    std::map<std::string, int> saveWith(const Plan& plan) const;
    /// Kills the save there, again and again; the next save then cleans up.
    void killAt(const Plan& plan) const;

  private:
    std::string old() const { return GetParam().exists ? Old : ""; }
    bool save(const TempFolder& folder) const {
        return GetParam().save((folder / GetParam().path).c_str()) == 1;
    }
    bool saved(const TempFolder& folder) const { return folder.read("target") == new_; }
    void prepare(const TempFolder& folder) const;
    void check(const TempFolder& folder, const Plan& plan) const;

    std::string new_;
};

void Saving::prepare(const TempFolder& folder) const {
    setenv("XDG_CONFIG_HOME", folder.path().c_str(), 1);
    for (const char* link : {"link", "settings"}) {
        std::filesystem::create_symlink("target", folder / link);
    }
    std::filesystem::create_symlink(".", folder / "quorle");
    if (!GetParam().exists) return;
    folder.write("target", Old);
    const std::string target = folder / "target";
    EXPECT_TRUE(getuid() != 0 || chown(target.c_str(), 1234, 1234) == 0);
    ASSERT_EQ(chmod(target.c_str(), 0604), 0);
    if (GetParam().damaged) cReadBinaryDictionary(target.c_str());
}

/// The old content or the new, and nothing beside it; a damaged file is kept exactly by a save.
void Saving::check(const TempFolder& folder, const Plan& plan) const {
    EXPECT_TRUE(saved(folder) || folder.read("target") == old());
    Names expected = Links;
    if (GetParam().exists || saved(folder)) expected.insert("target");
    if (GetParam().damaged && saved(folder)) {
        expected.insert("target.damaged");
        EXPECT_EQ(folder.read("target.damaged"), Old);
    }
    EXPECT_EQ(folder.names(), expected);
    for (const auto& link : Links) EXPECT_TRUE(std::filesystem::is_symlink(folder / link));
    // Without links a save that is killed leaves the old file under its second name alone.
    const bool moved = GetParam().noLinks && plan.fault == Fault::Kill;
    if (!GetParam().exists || moved) return;
    struct stat status {};
    ASSERT_EQ(stat((folder / "target").c_str(), &status), 0);
    EXPECT_EQ(status.st_mode & mode_t{07777}, 0604U);
    EXPECT_TRUE(getuid() != 0 || status.st_uid == 1234 || plan.call == "fchown");
}

std::map<std::string, int> Saving::saveWith(const Plan& plan) const {
    const TempFolder folder;
    prepare(folder);
    const int before = OpenFiles();
    FaultyCalls::Arm(plan);
    const bool done = save(folder);
    const auto calls = FaultyCalls::Disarm();
    EXPECT_EQ(OpenFiles(), before);
    check(folder, plan);
    // When the folder's sync has failed only whether the new content is on the disk is not known.
    const bool folderSync = plan.call == "fsync" && calls.count("renameat") == 1;
    EXPECT_EQ(done || folderSync, saved(folder));
    const Names fatal{"write", "fsync", "renameat", "fchmod"};
    const Names repeated{"openat", "read", "write", "fsync", "flock", "close"};
    if (plan.fault != Fault::Error || (plan.error == EINTR && repeated.count(plan.call) == 1)) {
        EXPECT_TRUE(done);
    } else if (fatal.count(plan.call) == 1) {
        EXPECT_FALSE(done);
    }
    return calls;
}

void Saving::killAt(const Plan& plan) const {
    const TempFolder folder;
    prepare(folder);
    for (int kill = 0; kill < 2 && !saved(folder); ++kill) {
        if (fork() == 0) {
            FaultyCalls::Arm(plan);
            save(folder);
            _exit(0);
        }
        int status = 0;
        wait(&status);
        EXPECT_TRUE(WIFSIGNALED(status) || kill > 0);
    }
    Names left = folder.names();
    for (const auto& own : Links) left.erase(own);
    for (const char* own : {"target", "target.damaged"}) left.erase(own);
    EXPECT_TRUE(left.empty() || left == Names{".quorle-save"});
    if (!saved(folder)) {
        FaultyCalls::Arm({Fault::None, "", 0, 0, GetParam().noLinks});
        EXPECT_TRUE(save(folder));
        FaultyCalls::Disarm();
    }
    check(folder, plan);
}

TEST_P(Saving, SurvivesEveryFault) {
    Plan plan{Fault::None, "", 0, 0, GetParam().noLinks};
    int faults = 0;
    for (const auto& [call, times] : saveWith(plan)) {
        plan.call = call;
        for (plan.number = 1; plan.number <= times; ++plan.number) {
            SCOPED_TRACE(call + " number " + std::to_string(plan.number));
            plan.fault = Fault::Error;
            for (const int error : {ENOSPC, EIO, EDQUOT, EACCES, EINTR}) {
                SCOPED_TRACE(strerror(error));
                plan.error = error;
                saveWith(plan);
            }
            plan.fault = Fault::Kill;
            killAt(plan);
            plan.fault = Fault::Short;  // only reading and writing can be
            saveWith(plan);
            faults += call == "read" || call == "write" ? 7 : 6;
        }
    }
    std::cout << "faults injected: " << faults << "\n";
    EXPECT_GT(faults, 50);
}

INSTANTIATE_TEST_SUITE_P(Scenarios, Saving, testing::ValuesIn(Scenarios),
                         [](const auto& each) { return std::string(each.param.name); });

}  // namespace
