#include "platform/services/Uuid.h"

#include <array>
#include <cstdint>
#include <cstdio>
#include <exception>
#include <random>

namespace orvane
{

std::optional<std::string> makeUuid()
{
    std::array<std::uint32_t, 4> words{};
    try {
        std::random_device random;
        for (std::uint32_t& word : words)
            word = random();
    } catch (const std::exception&) {
        return std::nullopt;
    }
    // Version 4 (random) and the variant of the standard form.
    words[1] = (words[1] & 0xFFFF0FFF) | 0x4000;
    words[2] = (words[2] & 0x3FFFFFFF) | 0x80000000;
    char text[40];
    std::snprintf(text, sizeof text, "%08X-%04X-%04X-%04X-%04X%08X", words[0], words[1] >> 16,
                  words[1] & 0xFFFF, words[2] >> 16, words[2] & 0xFFFF, words[3]);
    return text;
}

} // namespace orvane
