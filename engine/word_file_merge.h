#pragma once
// Merging word files into the dictionary, a step at a time.
#include <cstdint>

/// Does a step of at most about 8 ms and returns the percentage done: 0..99, never falling, then
/// 100. `path` starts a merge, or joins the line behind the one that steps; "dummy" and null only
/// step. With nothing stepping these, and what cannot be read, are 100 at once.
std::int32_t MergeStep(const char* path);
