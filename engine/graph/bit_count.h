#pragma once
// Walks count the letters before theirs at every step: they are compiled a second time for
// processors that have an instruction for it.

namespace Quorle {

#if defined(__x86_64__)
template <class Walk>
[[gnu::target("popcnt"), gnu::flatten]] auto ByInstruction(const Walk& walk) {
    return walk();
}
#endif

/// Calls `walk`, as fast as this processor counts bits.
template <class Walk>
auto CountingBits(const Walk& walk) {
#if defined(__x86_64__)
    if (__builtin_cpu_supports("popcnt")) return ByInstruction(walk);
#endif
    return walk();
}

}  // namespace Quorle
