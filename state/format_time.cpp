#include "state/format_time.h"

std::string Common::FormatTime(std::int16_t seconds) {
    const int minutes = seconds / 60;
    const int rest = seconds - 60 * minutes;
    return std::to_string(minutes) + (rest < 10 ? ":0" : ":") + std::to_string(rest);
}
