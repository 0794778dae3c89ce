// Runs a fuzz target over its corpus and over changed copies of it, without a fuzzer: what the
// tests do on every machine. Arguments: the corpus folder, the number of changed copies.
#include <iostream>
#include <iterator>
#include <random>
#include <vector>

#include "fuzz_target.h"

namespace {

using Input = std::vector<std::uint8_t>;

void Change(Input& input, std::minstd_rand& random) {
    const auto below = [&](std::size_t n) { return random() % n; };
    for (std::size_t changes = below(4) + 1; changes > 0; --changes) {
        const std::size_t place = below(input.size() + 1);
        const auto there = input.begin() + static_cast<std::ptrdiff_t>(place);
        const auto byte = static_cast<std::uint8_t>(below(256));
        if (place == input.size() || below(3) == 0) {
            input.insert(there, byte);
        } else if (below(2) == 0) {
            input.erase(there);
        } else {
            *there = byte;
        }
    }
}

}  // namespace

int main(int count, char** arguments) {
    if (count != 3) return 2;
    std::vector<Input> corpus;
    for (const auto& entry : std::filesystem::directory_iterator(arguments[1])) {
        std::ifstream file(entry.path(), std::ios::binary);
        const std::string text(std::istreambuf_iterator<char>(file), {});
        corpus.emplace_back(text.begin(), text.end());
    }
    if (corpus.empty()) return 2;
    const auto seed = std::random_device{}();
    std::cout << "seed " << seed << std::endl;
    std::minstd_rand random(seed);
    for (const Input& input : corpus) LLVMFuzzerTestOneInput(input.data(), input.size());
    for (long i = std::atol(arguments[2]); i > 0; --i) {
        Input input = corpus[random() % corpus.size()];
        Change(input, random);
        LLVMFuzzerTestOneInput(input.data(), input.size());
    }
    std::cout << corpus.size() << " inputs and " << arguments[2] << " changed copies\n";
}
