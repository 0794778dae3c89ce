#pragma once
// Looking for boards that are as hard as can be.
#include <functional>
#include <string>

/// Climbs from a few random boards, a letter at a time, to where `score` does not grow any more.
std::string HardestBoard(const std::function<long(const std::string&)>& score);
