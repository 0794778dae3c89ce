#pragma once
#include <string>

namespace Platform {

/// The folder of Dictionary.dat and Quorle.htm: the executable's own, or, for an
/// installed copy, the player's data folder, furnished on first use with the
/// installed dictionary and links to the help page and its picture.
std::string FindProgramFolder();

}  // namespace Platform
