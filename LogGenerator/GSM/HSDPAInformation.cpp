#include "LogGenerator/GSM/Sections.h"

#include "LogGenerator/Formats.h"
#include "LogGenerator/GSM/LogCodes.h"

namespace orvane
{

namespace
{

constexpr ValueName kCarrierConfigurations[] = {
    {0, "Single Carrier"},
    {1, "MIMO"          },
    {2, "Dual Carrier"  },
    {3, "Reserved"      },
};

constexpr Field kFields[] = {
    bytesField("Version", 13, 1, unsignedDecimal),
    bitsField("Sub Frames", 14, 0, 10, unsignedDecimal),
    bitsField("Carrier Info", 15, 2, 2, named<kCarrierConfigurations>),
};

constexpr Field kProcessFields[] = {
    bytesField("Process ID", 0, 1, unsignedDecimal),
    bytesField("No Rx Bits", 1, 4, unsignedDecimal),
    bytesField("New Tx", 5, 2, unsignedDecimal),
    bytesField("Block Errors", 7, 2, unsignedDecimal),
};

constexpr std::size_t kFirstProcess = 18;
constexpr std::size_t kProcessBytes = 9;
constexpr auto kPrimaryCount = countAt<16>;
constexpr auto kSecondaryCount = countAt<17>;

// Deliberate: the format keeps 162 bytes for each primary process, not the 9 of its record.
std::size_t firstSecondaryProcess(PacketView packet)
{
    return kFirstProcess + 162 * kPrimaryCount(packet);
}

struct ProcessList {
    const char* row;
    RecordLayout records;
};

constexpr ProcessList kProcessLists[] = {
    {"Primary HARQ Process",
     {kPrimaryCount, startAt<kFirstProcess>, kProcessBytes, kProcessFields} },
    {"Secondary HARQ Process",
     {kSecondaryCount, firstSecondaryProcess, kProcessBytes, kProcessFields}},
};

constexpr PacketLayout kPackets[] = {
    {kHsdpaCode, 18, kFields},
};

constexpr SectionLayout kLayout = {"HSDPA Info", "HSDPA Info", UnknownCode::Ignore, kPackets};

} // namespace

HSDPAInformation::HSDPAInformation() : Section(kLayout) {}

void HSDPAInformation::decode(PacketView packet, const PacketLayout& layout)
{
    Section::decode(packet, layout);
    // Deliberate: a packet without processes of a carrier leaves its last list on the screen.
    for (const ProcessList& list : kProcessLists)
        if (list.records.count(packet) != 0)
            rewriteListRow(rows().get(), list.row,
                           [&](ListElements& processes) { list.records.addTo(processes, packet); });
}

} // namespace orvane
