#include "LogGenerator/GSM/Sections.h"

#include "LogGenerator/GSM/GainControl.h"
#include "LogGenerator/GSM/LogCodes.h"
#include "platform/base/PropertyValue.h"

namespace orvane
{

namespace
{

constexpr Field kReceiverGain = bytesField("", 13, 2, decimal, Coding::Signed);

constexpr std::size_t kFirstCell = 16;
constexpr std::size_t kCellStride = 15;
constexpr std::size_t kFingerStride = 44;

constexpr Field kScramblingCode = bitsField("Scrambling Code", 7, 0, 13, decimal);
// Deliberate: a power in the unit of a ratio.
constexpr RowDescription kPower = {"RSCP", &decibels};
constexpr RowDescription kEnergy = {"Energy Per Chip", &decibels};
constexpr std::size_t kCellBytes = kScramblingCode.end();

// The set that a cell belongs to: the highest three bits, above the scrambling code.
constexpr std::int64_t kActive = 0;
std::optional<std::uint32_t> setOf(PacketView cell) { return cell.bitsAt(8, 5, 3); }

// The readings of a cell's finger record, of which the first that is not zero counts.
constexpr std::size_t kReadings[] = {32, 36, 40};

std::uint32_t energyRatio(PacketView finger)
{
    for (const std::size_t offset : kReadings)
        if (const auto reading = finger.unsignedAt(offset, 4).value_or(0))
            return static_cast<std::uint32_t>(reading);
    return 0;
}

constexpr PacketLayout kPackets[] = {ownPacket(kUmtsActiveSetCode, 16)};

constexpr SectionLayout kLayout = {"Active Set", "ActiveSet", UnknownCode::Report, kPackets};

} // namespace

ActiveSet::ActiveSet() : ListSection(kLayout) {}

void ActiveSet::fill(ListElements& elements, PacketView packet, const PacketLayout&)
{
    const std::size_t count = countAt<15>(packet);
    const Records cells(packet, kFirstCell, kCellStride, count);
    // Finger records follow all cell records, one for each cell of any set.
    const Records fingers(packet, kFirstCell + kCellStride * count, kFingerStride, count);
    const std::int64_t gain = gainControlDecibels(kReceiverGain.valueIn(packet).value_or(0));

    std::size_t index = 0;
    forEachWholeRecord(cells, kCellBytes, [&](PacketView cell) {
        const PacketView finger = fingers.at(index++);
        if (setOf(cell) != kActive || !finger.holds(0, kFingerStride))
            return;
        const std::int64_t energy = lookUpECNO(energyRatio(finger));
        const Reading readings[] = {
            readingOf(kScramblingCode, kScramblingCode.valueIn(cell).value_or(0)),
            readingOf(kPower, gain - 106 + energy),
            readingOf(kEnergy, energy),
        };
        elements.add(readings);
    });
}

} // namespace orvane
