#include "dlf/VersionReport.h"

#include "platform/services/Services.h"

#include <algorithm>
#include <cstddef>
#include <span>
#include <string>

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

// Deliberate: a NUL always ends the field, so "Orvane 2.5" is cut to "Orvane".
template <std::size_t Offset, std::size_t Width>
void putText(Report report, const char* text)
{
    const auto field = report.subspan<Offset, Width>();
    for (std::size_t i = 0; text && i + 1 < Width && text[i] != '\0'; ++i)
        field[i] = static_cast<std::uint8_t>(text[i]);
}

constexpr const char* kProgramName = "EXECUTABLE_NAME";
constexpr const char* kBuildDate = "Jun 13 2017 22:04:20";

std::string versionText()
{
    const auto& version = Services::current().version();
    return version ? "Orvane " + *version : "(none)";
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

bool writeVersionReport(std::span<std::uint8_t> buffer)
{
    const Clock& clock = Services::current().clock();
    const double now = clock.secondsSince1970();
    const TimeZone zone = clock.timeZoneAt(now);
    std::uint32_t written = 0;
    const int result = VRTDLFAddVersionReport(
        buffer.data(), static_cast<std::uint32_t>(buffer.size()), &written, 1, 1,
        versionText().c_str(), kProgramName, kBuildDate,
        static_cast<std::uint32_t>(static_cast<std::int64_t>(now)),
        static_cast<std::int16_t>(zone.secondsFromGmt / 60), zone.isDaylightSaving ? 1 : 0);
    if (result != 0)
        logError("Could not write DLF header (result=%d)", result);
    return result == 0;
}

} // namespace orvane
