#include "LogGenerator/GSM/Sections.h"

#include "LogGenerator/Formats.h"
#include "LogGenerator/GSM/RankingPacket.h"

namespace orvane
{

namespace
{

constexpr Field kCellFields[] = {
    bytesField("ARFCN", 0, 2, decimal),
    bytesField("BSIC", 2, 2, decimal),
    bytesField("RSSI", 4, 1, decibelMilliwatts, Coding::Signed),
    bytesField("Ranking Value", 5, 2, decimal, Coding::Signed),
};

constexpr RecordLayout kCells = {kGsmRankingCount, kFirstRankingRecord, 7, kCellFields};

constexpr PacketLayout kPackets[] = {recordsPacket(kUmtsRankingCode, kRankingMinimumBytes, kCells)};

constexpr SectionLayout kLayout = {"GSM Set", "GSMSet", UnknownCode::Report, kPackets};

} // namespace

GSMSet::GSMSet() : ListSection(kLayout) {}

} // namespace orvane
