#include "dlf/DlfWriter.h"

#include <algorithm>
#include <cstddef>
#include <span>

namespace orvane
{

namespace
{

constexpr int kBufferTooSmall = 3;

using Report = std::span<std::uint8_t, kDlfVersionReportBytes>;

template <std::size_t Offset, std::size_t Width>
void putNumber(Report report, std::uint32_t value)
{
    const auto field = report.subspan<Offset, Width>();
    for (std::size_t i = 0; i < Width; ++i)
        field[i] = static_cast<std::uint8_t>(value >> 8 * i);
}

// Cut so that a NUL always ends the field. That it cuts "Orvane 2.5" to "Orvane" is meant.
template <std::size_t Offset, std::size_t Width>
void putText(Report report, const char* text)
{
    const auto field = report.subspan<Offset, Width>();
    for (std::size_t i = 0; text && i + 1 < Width && text[i] != '\0'; ++i)
        field[i] = static_cast<std::uint8_t>(text[i]);
}

} // namespace

int VRTDLFAddVersionReport(std::uint8_t* buffer, std::uint32_t size, std::uint32_t* written,
                           std::uint16_t firstVersion, std::uint16_t secondVersion,
                           const char* versionText, const char* programName,
                           const char* buildDateText, std::uint32_t time, std::int16_t zoneMinutes,
                           std::uint8_t isDaylightSaving)
{
    if (written)
        *written = 0;
    if (!buffer || size < kDlfVersionReportBytes)
        return kBufferTooSmall;

    const Report report(buffer, kDlfVersionReportBytes);
    std::fill(report.begin(), report.end(), std::uint8_t{0});
    putNumber<0, 2>(report, kDlfVersionReportBytes);
    putNumber<2, 2>(report, kDlfVersionReportCode);
    putNumber<12, 2>(report, firstVersion);
    putNumber<14, 2>(report, secondVersion);
    putText<16, 7>(report, versionText);
    putText<23, 16>(report, programName);
    putText<63, 18>(report, buildDateText);
    putNumber<81, 4>(report, time);
    putNumber<85, 2>(report, static_cast<std::uint16_t>(zoneMinutes));
    putNumber<87, 2>(report, isDaylightSaving ? 1 : 0);
    if (written)
        *written = kDlfVersionReportBytes;
    return 0;
}

} // namespace orvane
