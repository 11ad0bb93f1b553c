#pragma once

#include <cstdint>
#include <span>

namespace orvane
{

// Length of the version report, the first item of a DLF file.
constexpr std::uint32_t kDlfVersionReportBytes = 161;

// Log code of the version report.
constexpr std::uint16_t kDlfVersionReportCode = 0x1FFD;

// Writes the version report at the start of `buffer`, little-endian, its unused bytes zero.
// `versionText` is cut to 6 characters, `programName` to 15, `buildDateText` to 17, each followed
// by a NUL; one that is null is stored empty. `time` is in seconds since 1970-01-01 UTC,
// `zoneMinutes` the local zone's offset from GMT, east positive, `isDaylightSaving` anything but 0
// for yes.
// `*written` (may be null) becomes the number of bytes written. Returns 0, or 3 without writing
// where the buffer is null or shorter than the report.
int VRTDLFAddVersionReport(std::uint8_t* buffer, std::uint32_t size, std::uint32_t* written,
                           std::uint16_t firstVersion, std::uint16_t secondVersion,
                           const char* versionText, const char* programName,
                           const char* buildDateText, std::uint32_t time, std::int16_t zoneMinutes,
                           std::uint8_t isDaylightSaving);

// Writes the version report with which this program's DLF files begin at the start of the buffer:
// program version, clock time and local time zone. Returns false, with an error line in the log,
// where it does not fit.
bool writeVersionReport(std::span<std::uint8_t> buffer);

} // namespace orvane
