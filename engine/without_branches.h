#pragma once
// Conditions as numbers, 1 or 0, and choices by them, for loops whose data foresees no branch. They
// are worked out from signs: from a comparison the compiler would make a branch again, or set a
// byte of a register, and the rest of it would have to be waited for.
#include <cstdint>

/// 1 when a < b, else 0.
constexpr std::uint32_t IsLess(std::uint32_t a, std::uint32_t b) {
    return static_cast<std::uint32_t>((std::uint64_t{a} - b) >> 63);
}

/// The first when `condition` is 1, the second when it is 0.
constexpr std::uint32_t Choose(std::uint32_t condition, std::uint32_t first, std::uint32_t second) {
    return second ^ ((first ^ second) & (0 - condition));
}
