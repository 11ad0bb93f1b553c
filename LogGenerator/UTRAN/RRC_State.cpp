#include "LogGenerator/UTRAN/Sections.h"

#include "LogGenerator/Formats.h"
#include "platform/base/PropertyValue.h"
#include "platform/services/Console.h"

namespace orvane
{

namespace
{

constexpr std::uint32_t kStateCode = 0xD0E0;
constexpr std::size_t kExpectedBytes = 15;

constexpr std::size_t kModeValid = 13; // 1 where the mode counts
constexpr std::size_t kMode = 14;
constexpr std::uint64_t kNoMode = 255;

constexpr ValueName kModes[] = {
    {0, "Disconnected"},
    {1, "Connecting"  },
    {2, "Cell Fach"   },
    {3, "Cell DCH"    },
    {4, "Cell PCH"    },
    {5, "Cell URA PCH"},
};

constexpr Format kModeName = namesFormat(kModes, "Unknown RRC Mode");
constexpr RowDescription kState = {"State", &kModeName};

int modeIn(PacketView packet)
{
    const bool isValid = packet.unsignedAt(kModeValid, 1) == 1U;
    return static_cast<int>(isValid ? packet.unsignedAt(kMode, 1).value_or(kNoMode) : kNoMode);
}

constexpr PacketLayout kPackets[] = {ownPacket(kStateCode, 0)};

constexpr SectionLayout kLayout = {"RRC Info", "RRC Info", UnknownCode::Ignore, kPackets};

} // namespace

RRC_State::RRC_State() : Section(kLayout) {}

void RRC_State::decode(PacketView packet, const PacketLayout&)
{
    // A short packet is decoded all the same: this is only a warning.
    if (packet.size() < kExpectedBytes)
        logWarning("LogCode_0xD0E0 is length is %ld expected size %ld",
                   static_cast<long>(packet.size()), static_cast<long>(kExpectedBytes));
    const int mode = modeIn(packet);
    const auto shown = rows();
    setReading(shown.get(), kState, mode);
    consoleLine("Display Dict = %s, rrc mode = %d %s", PropertyValue(shown).description().c_str(),
                mode, nameOf(kModes, mode, "Unknown RRC Mode"));
}

} // namespace orvane
