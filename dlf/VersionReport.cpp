#include "dlf/VersionReport.h"

#include "dlf/DlfWriter.h"
#include "platform/services/Services.h"

#include <string>

namespace orvane
{

namespace
{

constexpr const char* kProgramName = "EXECUTABLE_NAME";
constexpr const char* kBuildDate = "Jun 13 2017 22:04:20";

std::string versionText()
{
    const auto& version = Services::current().version();
    return version ? "Orvane " + *version : "(none)";
}

} // namespace

std::optional<Bytes> makeVersionReport()
{
    Bytes report(kDlfVersionReportBytes, 0);
    const Clock& clock = Services::current().clock();
    const double now = clock.secondsSince1970();
    const TimeZone zone = clock.timeZoneAt(now);
    std::uint32_t written = 0;
    const int result = VRTDLFAddVersionReport(
        report.data(), static_cast<std::uint32_t>(report.size()), &written, 1, 1,
        versionText().c_str(), kProgramName, kBuildDate,
        static_cast<std::uint32_t>(static_cast<std::int64_t>(now)),
        static_cast<std::int16_t>(zone.secondsFromGmt / 60), zone.isDaylightSaving ? 1 : 0);
    if (result != 0) {
        logError("Could not write DLF header (result=%d)", result);
        return std::nullopt;
    }
    return report;
}

} // namespace orvane
