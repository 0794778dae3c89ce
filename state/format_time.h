#pragma once
#include <cstdint>
#include <string>

namespace Common {

/// Minutes, a colon and two-digit seconds: "3:00" for 180. seconds: 0..32767.
std::string FormatTime(std::int16_t seconds);

}  // namespace Common
