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
    for (std::size_t changes = random() % 4 + 1; changes > 0; --changes) {
        const std::size_t place = random() % (input.size() + 1);
        const auto there = input.begin() + static_cast<std::ptrdiff_t>(place);
        const auto byte = static_cast<std::uint8_t>(random() % 256);
        if (place == input.size() || random() % 3 == 0) {
            input.insert(there, byte);
        } else if (random() % 2 == 0) {
            input.erase(there);
        } else {
            *there = byte;
        }
    }
}

}  // namespace

int main(int, char** arguments) {
    std::vector<Input> corpus;
    for (const auto& entry : std::filesystem::directory_iterator(arguments[1])) {
        std::ifstream file(entry.path(), std::ios::binary);
        corpus.emplace_back(std::istreambuf_iterator<char>(file), std::istreambuf_iterator<char>());
        LLVMFuzzerTestOneInput(corpus.back().data(), corpus.back().size());
    }
    const auto seed = std::random_device{}();
    std::cout << "seed " << seed << std::endl;
    std::minstd_rand random(seed);
    for (long i = std::atol(arguments[2]); i > 0; --i) {
        Input input = corpus.at(random() % corpus.size());
        Change(input, random);
        LLVMFuzzerTestOneInput(input.data(), input.size());
    }
}
