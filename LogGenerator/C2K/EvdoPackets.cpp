#include "LogGenerator/C2K/C2KDecoders.h"
#include "LogGenerator/C2K/C2KFormats.h"
#include "LogGenerator/Records.h"
#include "platform/base/PropertyValue.h"
#include "platform/services/SystemLog.h"

// The 1xEV-DO packets: air-link summary, active-set pilots, finger C/I.

namespace orvane
{

namespace
{

constexpr const char* kNone = "(none)";
constexpr std::uint64_t kNoPilot = 0xFFFF;

// Deliberate: the sign is the multiplication sign, not an x.
constexpr Format kServingPilot = wholeFormat(" × 64chips").withText(kNoPilot, "Invalid Value");

std::string terminalIdentifier(std::int64_t raw)
{
    return printed("0x%06x", static_cast<unsigned>(raw));
}
constexpr Format kTerminalIdentifier(terminalIdentifier);

constexpr RowDescription kPilotLevel = {"", &energyLevel};

PropertyValue levelReading(std::uint64_t energy)
{
    return PropertyValue::reading(readingOf(kPilotLevel, static_cast<std::int64_t>(energy)));
}

constexpr unsigned kSummaryBytes = 50;
constexpr std::size_t kDeviceStateOffset = 36;
constexpr std::uint64_t kAccessState = 4; // and above: the phone transmits

constexpr Field kSummaryFields[] = {
    bitsField("kChannel", 13, 0, 11, decimal),
    bytesField("k1xEVDODeviceState", kDeviceStateOffset, 1, evdoDeviceState),
    bitsField("kBandClass", 14, 3, 5, bandClass),
    bytesField("kRxAGC0", 15, 1, signedDecibelMilliwatts, Coding::Signed),
    bytesField("kServingPNOffset", 18, 2, kServingPilot),
    bytesField("kSessionState", 37, 1, evdoSessionState),
    bytesField("kUATI24", 38, 3, kTerminalIdentifier),
    bytesField("kColorCode", 41, 1, decimal),
};

constexpr Field kTransmittingFields[] = {
    bytesField("kRxAGC1", 16, 1, signedDecibelMilliwatts, Coding::Signed),
    bytesField("kTxAGC", 17, 1, signedDecibelMilliwatts, Coding::Signed),
};

constexpr unsigned kActiveSetBytes = 25;
constexpr unsigned kPilotBytes = 12;
constexpr unsigned kFingersBytes = 23;
constexpr unsigned kFingerBytes = 14;

} // namespace

void decodeEvdoSummary(PacketView packet, PropertyDictionary&, const C2KPublisher& publisher)
{
    if (packet.size() != kSummaryBytes) {
        logError("Log code 0x1183 is %u bytes long but should be %lu bytes.",
                 static_cast<unsigned>(packet.size()), static_cast<unsigned long>(kSummaryBytes));
        return;
    }
    publisher.publish(packet, kSummaryFields);
    if (packet.unsignedAt(kDeviceStateOffset, 1) < kAccessState)
        publisher.publishText("N/A", kTransmittingFields);
    else
        publisher.publish(packet, kTransmittingFields);
}

void decodeEvdoActiveSet(PacketView packet, PropertyDictionary&, const C2KPublisher& publisher)
{
    const auto size = static_cast<unsigned>(packet.size());
    if (size < kActiveSetBytes) {
        logError("Log code 0x12b6 is %u bytes long but must be at least %lu bytes.", size,
                 static_cast<unsigned long>(kActiveSetBytes));
        return;
    }
    const auto count = static_cast<unsigned>(packet.unsignedAt(15, 1).value_or(0));
    if (size < kActiveSetBytes + kPilotBytes * count) {
        logError("Log code 0x12b6 is %u bytes long, but has %d substructs.", size,
                 static_cast<int>(count));
        return;
    }
    if (count == 0) {
        publisher.publish("kActiveSetPilots", kNone);
        return;
    }
    const PropertyValue pilots = newSortedRows();
    const Records records(packet, kActiveSetBytes, kPilotBytes, count);
    for (unsigned i = 0; i < count; ++i) {
        const PacketView pilot = records.at(i);
        const auto offset = static_cast<int>(pilot.unsignedAt(0, 2).value_or(0));
        pilots.asDictionary()->set(printed("%d;%d", static_cast<int>(i), offset),
                                   levelReading(pilot.unsignedAt(2, 2).value_or(0)));
    }
    publisher.publish("kActiveSetPilots", pilots);
}

void decodeFingers(PacketView packet, PropertyDictionary&, const C2KPublisher& publisher)
{
    const auto size = static_cast<unsigned>(packet.size());
    if (size < kFingersBytes) {
        logError("Log code 0x108a is %u bytes long but must be at least %lu bytes.", size,
                 static_cast<unsigned long>(kFingersBytes));
        return;
    }
    const auto count = static_cast<unsigned>(packet.unsignedAt(22, 1).value_or(0));
    if (size != kFingersBytes + kFingerBytes * count) {
        logError("Log code 0x108a has bad length of %u bytes, but has %d substructs (size=%lu).",
                 size, static_cast<int>(count), static_cast<unsigned long>(kFingersBytes));
        return;
    }
    const PropertyValue fingers = newSortedRows();
    const Records records(packet, kFingersBytes, kFingerBytes, count);
    bool isAnyShown = false;
    for (unsigned i = 0; i < count; ++i) {
        const PacketView finger = records.at(i);
        const auto pilot = finger.unsignedAt(0, 2).value_or(0);
        if (pilot == kNoPilot)
            continue;
        isAnyShown = true;
        fingers.asDictionary()->set(printed("%d;%d", static_cast<int>(i), static_cast<int>(pilot)),
                                    levelReading(finger.unsignedAt(6, 2).value_or(0)));
    }
    publisher.publish("kFingerC2I", isAnyShown ? fingers : PropertyValue(kNone));
}

} // namespace orvane
