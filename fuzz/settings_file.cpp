// Any bytes as the settings file: values are read or absent, and storing one keeps the rest.
#include "fuzz_target.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    Fuzz::Write("quorle/settings", Fuzz::Text(data, size));
    char buffer[256];
    std::int32_t length = sizeof buffer;
    const std::int32_t present = cGetRegValue("key", "name", buffer, &length);
    REQUIRE(present == 0 ? length == 0 : length >= 0 && length <= 255);

    length = sizeof buffer;
    const std::int32_t other = cGetRegValue("key", "other", buffer, &length);
    const std::string value(buffer, static_cast<std::size_t>(length));
    REQUIRE(cSetRegValue("key", "name", "stored", 6) == 1);
    length = sizeof buffer;
    REQUIRE(cGetRegValue("key", "name", buffer, &length) == 1);
    REQUIRE(std::string_view(buffer, static_cast<std::size_t>(length)) == "stored");
    length = sizeof buffer;
    REQUIRE(cGetRegValue("key", "other", buffer, &length) == other);
    REQUIRE(std::string_view(buffer, static_cast<std::size_t>(length)) == value);
    return 0;
}
