#include "LogGenerator/VRNLogGenerator.h"

#include "LogGenerator/DlfWriter.h"
#include "LogGenerator/StateKeys.h"
#include "platform/Services.h"

#include <cstdio>
#include <utility>

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

std::optional<Bytes> versionReport()
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

} // namespace

void VRNLogGenerator::init()
{
    LogGenerator::init();
    _binData.emplace();
}

void VRNLogGenerator::appendToBinData(ByteView message)
{
    if (_binData)
        _binData->insert(_binData->end(), message.begin(), message.end());
}

void VRNLogGenerator::moveBinDataToState(PropertyDictionary& state)
{
    if (!_binData)
        return;
    state.set(kDisplayStateKey, PropertyValue::data(std::exchange(*_binData, Bytes())));
}

std::optional<Bytes> VRNLogGenerator::generateDlfFromState(const PropertyDictionary& state)
{
    std::optional<Bytes> dlf = versionReport();
    const PropertyArray* history = state[kHistoryKey].asArray();
    if (!dlf || !history)
        return dlf;
    for (const PropertyValue& snapshot : *history) {
        const PropertyValue& messages = snapshot[kDisplayStateKey];
        if (!messages)
            continue;
        const Bytes* bytes = messages.asData();
        if (!bytes) {
            logError("Got wrong class writing history to DLF; aborting writing the DLF file");
            return std::nullopt;
        }
        // Only the first message of a snapshot loses its type byte; later ones keep theirs, and
        // wrapped ones their wrapper. This is meant.
        if (bytes->size() >= 2)
            dlf->insert(dlf->end(), bytes->begin() + 1, bytes->end());
    }
    return dlf;
}

PropertyValue VRNLogGenerator::getSaveContentsFromState(PropertyDictionary& state)
{
    PropertyValue contents = historyOf(state);
    if (std::optional<Bytes> dlf = generateDlfFromState(state)) {
        char description[64];
        std::snprintf(description, sizeof description, "DLF binary (%d bytes)",
                      static_cast<int>(dlf->size()));
        contents.asArray()->append(PropertyValue::dictionaryOf({
            {kDescriptionKey, description                         },
            {"DLF",           PropertyValue::data(std::move(*dlf))}
        }));
    }
    return contents;
}

} // namespace orvane
