#pragma once
// Dictionary files that were tampered with.
#include <string>

/// The file with the CRC-32C of all its other bytes put in, where it has room for that.
inline std::string Sealed(std::string file) {
    constexpr std::size_t At = 4, End = 8;
    std::uint32_t checksum = ~0U;
    for (std::size_t i = 0; i < file.size(); ++i) {
        if (i >= At && i < End) continue;
        checksum ^= static_cast<unsigned char>(file[i]);
        for (int bit = 0; bit < 8; ++bit) checksum = checksum >> 1 ^ (checksum & 1) * 0x82F63B78U;
    }
    for (std::size_t i = At; i < End && file.size() >= End; ++i, checksum >>= 8) {
        file[i] = static_cast<char>(~checksum);
    }
    return file;
}
