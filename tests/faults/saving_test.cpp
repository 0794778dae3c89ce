// Every system call of a save fails, is cut short or is the process's last, one at a time.
#include <gtest/gtest.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cstring>
#include <iostream>

#include "damaged_file.h"
#include "faulty_calls.h"
#include "replace_file.h"
#include "settings_file.h"
#include "tests/engine/temp_folder.h"

namespace {

using FaultyCalls::Fault;
using FaultyCalls::Plan;
using Names = std::set<std::string>;

constexpr const char* Old = "old words";
constexpr const char* New = "entirely new words";

/// A save into the file "target" of the folder, by the paths that a save can take.
struct Scenario {
    const char* name;
    bool exists;
    bool noLinks;
    void (*prepare)(const TempFolder&);
    bool (*save)(const TempFolder&);
    const char* old;
    const char* fresh;
};

void PrintTo(const Scenario& scenario, std::ostream* out) {
    *out << scenario.name;
}

bool SaveText(const TempFolder& folder, const char* name) {
    return ReplaceFile((folder / name).c_str(), std::as_bytes(std::span(New, strlen(New))));
}

void MarkDamaged(const TempFolder& folder) {
    RememberDamaged((folder / "target").c_str());
}

const Scenario Scenarios[] = {
    {"NewFile", false, false, nullptr, [](auto& in) { return SaveText(in, "target"); }, "", New},
    {"OldFileThroughLinks", true, false, nullptr, [](auto& in) { return SaveText(in, "link"); },
     Old, New},
    {"DamagedFile", true, false, MarkDamaged, [](auto& in) { return SaveText(in, "target"); }, Old,
     New},
    {"DamagedFileWithoutLinks", true, true, MarkDamaged,
     [](auto& in) { return SaveText(in, "target"); }, Old, New},
    {"Setting", true, false, nullptr, [](auto&) { return SetSetting("key", "name", "value"); }, Old,
     "old words\nkey\tname\tvalue\n"},
};

class Saving : public testing::TestWithParam<Scenario> {
  protected:
    std::map<std::string, int> saveWith(const Plan& plan) const;
    void killAt(const Plan& plan) const;

  private:
    void prepare(const TempFolder& folder) const;
    void checkFile(const TempFolder& folder, const Plan& plan) const;
    void checkNames(const TempFolder& folder, bool saved) const;
};

int OpenFiles() {
    const std::filesystem::directory_iterator all("/proc/self/fd");
    return static_cast<int>(std::distance(begin(all), end(all)));
}

/// Every path of a scenario leads to the one file "target" in the one folder.
void Saving::prepare(const TempFolder& folder) const {
    setenv("XDG_CONFIG_HOME", folder.path().c_str(), 1);
    std::filesystem::create_symlink("target", folder / "link");
    std::filesystem::create_symlink("target", folder / "settings");
    std::filesystem::create_symlink(".", folder / "quorle");
    if (GetParam().exists) {
        folder.write("target", GetParam().old);
        const std::string target = folder / "target";
        if (getuid() == 0) {
            ASSERT_EQ(chown(target.c_str(), 1234, 1234), 0);
        }
        ASSERT_EQ(chmod(target.c_str(), 0604), 0);
    }
    if (GetParam().prepare != nullptr) GetParam().prepare(folder);
}

void Saving::checkFile(const TempFolder& folder, const Plan& plan) const {
    for (const char* link : {"link", "settings", "quorle"}) {
        EXPECT_TRUE(std::filesystem::is_symlink(folder / link));
    }
    if (!GetParam().exists) return;
    struct stat status {};
    ASSERT_EQ(stat((folder / "target").c_str(), &status), 0);
    EXPECT_EQ(status.st_mode & mode_t{07777}, 0604U);
    if (getuid() == 0 && plan.call != "fchown") {
        EXPECT_EQ(status.st_uid, 1234U);
    }
}

/// Nothing stands in the folder but what should; a damaged file is kept exactly by a save.
void Saving::checkNames(const TempFolder& folder, bool saved) const {
    Names expected{"link", "settings", "quorle"};
    if (GetParam().exists || saved) expected.insert("target");
    if (GetParam().prepare != nullptr && saved) {
        // Where a copy's name could not be looked at the next one is taken.
        const std::string second = "target.damaged.2";
        const std::string kept = folder.names().count(second) == 1 ? second : "target.damaged";
        expected.insert(kept);
        EXPECT_EQ(folder.read(kept), Old);
    }
    EXPECT_EQ(folder.names(), expected);
}

/// Saves under the plan, checks what is there afterwards and returns the calls that were made.
std::map<std::string, int> Saving::saveWith(const Plan& plan) const {
    const TempFolder folder;
    prepare(folder);
    const int before = OpenFiles();
    FaultyCalls::Arm(plan);
    const bool done = GetParam().save(folder);
    const auto calls = FaultyCalls::Disarm();
    EXPECT_EQ(OpenFiles(), before);

    const bool fresh = folder.read("target") == GetParam().fresh;
    EXPECT_TRUE(fresh || folder.read("target") == GetParam().old);
    const bool folderSync = plan.call == "fsync" && calls.count("renameat") == 1;
    if (!done && folderSync) {
        EXPECT_TRUE(fresh);  // only whether it is on the disk is not known
    } else {
        EXPECT_EQ(done, fresh);
    }
    const bool mayBeRepeated = plan.call == "openat" || plan.call == "write" ||
                               plan.call == "fsync" || plan.call == "flock" ||
                               plan.call == "read" || plan.call == "close";
    if (plan.fault != Fault::Error || (plan.error == EINTR && mayBeRepeated)) {
        EXPECT_TRUE(done);
    }
    checkFile(folder, plan);
    checkNames(folder, fresh);
    return calls;
}

/// Kills the save there, twice; the next save then cleans up.
void Saving::killAt(const Plan& plan) const {
    const TempFolder folder;
    prepare(folder);
    for (int kill = 0; kill < 2 && folder.read("target") != GetParam().fresh; ++kill) {
        const pid_t child = fork();
        if (child == 0) {
            FaultyCalls::Arm(plan);
            GetParam().save(folder);
            _exit(0);
        }
        int status = 0;
        waitpid(child, &status, 0);
        if (kill == 0) {
            EXPECT_TRUE(WIFSIGNALED(status));
        }
    }
    Names left = folder.names();
    for (const char* own : {"link", "settings", "quorle", "target", "target.damaged"}) {
        left.erase(own);
    }
    EXPECT_TRUE(left.empty() || left == Names{".quorle-save"});
    const std::string content = folder.read("target");
    EXPECT_TRUE(content == GetParam().fresh || content == GetParam().old);
    checkFile(folder, plan);
    if (content == GetParam().fresh) return;
    FaultyCalls::Arm({Fault::None, "", 0, 0, GetParam().noLinks});
    EXPECT_TRUE(GetParam().save(folder));
    FaultyCalls::Disarm();
    checkNames(folder, true);
}

TEST_P(Saving, SurvivesEveryFault) {
    Plan plan{Fault::None, "", 0, 0, GetParam().noLinks};
    const auto calls = saveWith(plan);
    int faults = 0;
    for (const auto& [call, times] : calls) {
        plan.call = call;
        for (plan.number = 1; plan.number <= times; ++plan.number) {
            SCOPED_TRACE(call + " number " + std::to_string(plan.number));
            plan.fault = Fault::Error;
            for (const int error : {ENOSPC, EIO, EDQUOT, EACCES, EINTR}) {
                SCOPED_TRACE(strerror(error));
                plan.error = error;
                saveWith(plan);
                ++faults;
            }
            plan.fault = Fault::Kill;
            killAt(plan);
            plan.fault = Fault::Short;
            if (call == "read" || call == "write") saveWith(plan);
            faults += call == "read" || call == "write" ? 2 : 1;
        }
    }
    std::cout << "faults injected: " << faults << "\n";
    EXPECT_GT(faults, 50);
}

INSTANTIATE_TEST_SUITE_P(Scenarios, Saving, testing::ValuesIn(Scenarios),
                         [](const auto& each) { return std::string(each.param.name); });

}  // namespace
