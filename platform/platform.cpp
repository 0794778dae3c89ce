#include "platform/platform.h"

#include <chrono>
#include <random>

namespace {

std::mt19937& Generator() {
    static std::mt19937 generator;
    return generator;
}

void SeedFromTimeOfDay() {
    const auto now = std::chrono::system_clock::now().time_since_epoch();
    const auto ticks = static_cast<std::uint64_t>(now.count());
    std::seed_seq seed{static_cast<std::uint32_t>(ticks), static_cast<std::uint32_t>(ticks >> 32)};
    Generator().seed(seed);
}

// The upper 24 bits fill a single's mantissa exactly, so the result is never 1.
float DrawNumber() {
    return static_cast<float>(Generator()() >> 8) * 0x1p-24F;
}

double SecondsSinceBoot() {
    return std::chrono::duration<double>(std::chrono::steady_clock::now().time_since_epoch())
        .count();
}

}  // namespace

namespace Platform {

// Without a desktop there is nobody to ask and nothing to play.
std::function<void(const std::string&, const std::string&)> ShowMessage = [](const std::string&,
                                                                             const std::string&) {};
std::function<bool(const std::string&, const std::string&)> AskYesNo =
    [](const std::string&, const std::string&) { return false; };
std::function<std::string(const std::string&)> ChooseFileToOpen = [](const std::string&) {
    return std::string();
};
std::function<std::string(const std::string&)> ChooseFileToSave = [](const std::string&) {
    return std::string();
};
std::function<void()> WarningSound = [] {};
std::function<void(const std::string&)> Tell = [](const std::string&) {};
std::function<std::int32_t()> WindowInFront = [] { return 0; };
std::function<bool()> OnWayland = [] { return false; };
std::function<void()> SeedRandom = SeedFromTimeOfDay;
std::function<float()> RandomNumber = DrawNumber;
std::function<double()> SteadySeconds = SecondsSinceBoot;
std::function<std::string()> ProgramFolder = [] { return std::string("."); };

}  // namespace Platform
