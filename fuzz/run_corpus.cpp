// Runs a fuzz target over its corpus and over changed copies of it, without a fuzzer: what the
// tests do on every machine. Arguments: the corpus folder, the number of changed copies.
#include <filesystem>
#include <fstream>
#include <iostream>
#include <iterator>
#include <random>
#include <vector>

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size);

int main(int, char** arguments) {
    std::vector<std::string> inputs;
    for (const auto& entry : std::filesystem::directory_iterator(arguments[1])) {
        std::ifstream file(entry.path(), std::ios::binary);
        inputs.emplace_back(std::istreambuf_iterator<char>(file), std::istreambuf_iterator<char>());
    }
    const auto seed = std::random_device{}();
    std::cout << "seed " << seed << std::endl;
    std::minstd_rand random(seed);
    const std::size_t originals = inputs.size();
    for (std::size_t copies = std::stoul(arguments[2]); copies > 0; --copies) {
        std::string copy = inputs.at(random() % originals);
        for (auto changes = random() % 5; changes > 0; --changes) {
            const auto byte = static_cast<char>(random());
            copy.replace(random() % (copy.size() + 1), random() % 2, random() % 2, byte);
        }
        inputs.push_back(copy);
    }
    for (const std::string& each : inputs) {
        LLVMFuzzerTestOneInput(reinterpret_cast<const std::uint8_t*>(each.data()), each.size());
    }
}
