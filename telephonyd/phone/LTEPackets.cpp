#include "telephonyd/phone/LTEPackets.h"

#include "telephonyd/phone/ModemItem.h"

#include <algorithm>
#include <cmath>

namespace orvane
{

namespace
{

constexpr std::size_t kMostMeasured = 2;
constexpr std::uint16_t kMobileCountryCode = 1;
constexpr std::uint16_t kMobileNetworkCode = 1;
constexpr int kTransmitPower = 23; // dBm
constexpr std::uint32_t kPowerLimitAbsent = 64;
constexpr std::uint32_t kSearchLimitAbsent = 32;

// Two scales for power, two for quality: which one a field has depends on its packet.
std::uint32_t quarterPower(double power) { return rawValue(power, -140, 0.25, 9); }
std::uint32_t halfPower(double power, unsigned width) { return rawValue(power, -140, 0.5, width); }
std::uint32_t quarterQuality(double quality) { return rawValue(quality, -30, 0.25, 7); }
std::uint32_t eighthQuality(double quality) { return rawValue(quality, -20, 0.125, 8); }
std::uint32_t wholeDecibels(int decibels, unsigned width)
{
    return rawValue(decibels, -30, 1, width);
}

std::uint32_t leastPowerField(const LTECell& cell)
{
    return rawValue(leastPower(cell), -140, 2, 6);
}

} // namespace

int leastPower(const LTECell& cell) { return cell.resourceBlocks >= 75 ? -124 : -128; }

int selectionLevel(const LTECell& cell, double averagePower)
{
    return static_cast<int>(std::lround(averagePower)) - leastPower(cell);
}

PhoneMessage lteServingCell(const LTECell& cell)
{
    PacketWriter writer;
    writer.put8(2)
        .put16(cell.physicalCellId)
        .put16(cell.earfcn)
        .put16(cell.uplinkEarfcn)
        .put8(cell.resourceBlocks)
        .put8(cell.resourceBlocks)
        .put32(cell.cellIdentity)
        .put16(cell.trackingAreaCode)
        .put32(cell.band)
        .put16(kMobileCountryCode)
        .put8(2) // digits of the network code
        .put16(kMobileNetworkCode)
        .put8(0); // access is not barred
    return modemItem(kLTEServingCellCode, writer);
}

PhoneMessage lteMasterInformation(const LTECell& cell, std::uint16_t systemFrame)
{
    PacketWriter writer;
    writer.put8(1)
        .put16(cell.physicalCellId)
        .put16(cell.earfcn)
        .put16(systemFrame)
        .put8(cell.antennas)
        .put8(cell.resourceBlocks);
    return modemItem(kLTEMasterInformationCode, writer);
}

PhoneMessage lteServingMeasurement(const LTELevels& serving, bool rulesUpdated)
{
    const LTECell& cell = serving.cell;
    const int level = selectionLevel(cell, serving.averagePower);
    constexpr std::uint32_t kIntraSearch = 31; // halves of the threshold in dB: search below 62
    constexpr std::uint32_t kOtherSearch = 7;
    const bool searchesIntra = level <= 2 * static_cast<int>(kIntraSearch);
    const bool searchesOthers = level <= 2 * static_cast<int>(kOtherSearch);
    PacketWriter writer;
    writer.put8(4).skip(3).put16(cell.earfcn);
    writer.bits(cell.physicalCellId, 9).bits(cell.priority, 4).bits(0, 3);
    writer.bits(quarterPower(serving.power), 9)
        .bits(quarterPower(serving.averagePower), 9)
        .bits(quarterQuality(serving.quality), 7)
        .bits(quarterQuality(serving.averageQuality), 7);
    writer.bits(halfPower(serving.totalPower, 9), 9)
        .bits(leastPowerField(cell), 6)
        .bits(cell.antennas == 1 ? kPowerLimitAbsent : wholeDecibels(kTransmitPower, 7), 7)
        .bits(wholeDecibels(kTransmitPower, 6), 6)
        .bits(0, 4);
    writer.bits(wholeDecibels(level, 7), 7)
        .bits(level < 0 ? 1 : 0, 6) // paging cycles in a row below the least power
        .bits(kIntraSearch, 6)
        .bits(cell.priority >= 6 ? kSearchLimitAbsent : kOtherSearch, 6)
        .bits(rulesUpdated ? 1 : 0, 1)
        .bits((searchesIntra ? 1U : 0U) | (searchesOthers ? 2U : 0U), 4)
        .bits(0, 2);
    return modemItem(kLTEServingMeasurementCode, writer);
}

PhoneMessage lteConnectedMeasurement(const LTELevels& serving, std::span<const LTELevels> others,
                                     std::uint16_t subframe)
{
    constexpr std::size_t kMostDetected = 8;
    const auto measured = others.first(std::min(others.size(), kMostMeasured));
    auto detected = others.subspan(measured.size());
    detected = detected.first(std::min(detected.size(), kMostDetected));
    const auto wholePower = [](double power) { return rawValue(power, -140, 0.25, 16); };
    PacketWriter writer;
    writer.put8(3)
        .skip(3)
        .put16(serving.cell.earfcn)
        .put16(serving.cell.physicalCellId)
        .put16(subframe)
        .put16(wholePower(serving.averagePower))
        .put16(eighthQuality(serving.averageQuality))
        .put8(static_cast<std::uint32_t>(measured.size()))
        .put8(static_cast<std::uint32_t>(detected.size()));
    for (const LTELevels& other : measured)
        writer.put16(other.cell.physicalCellId)
            .put16(wholePower(other.averagePower))
            .put16(eighthQuality(other.averageQuality));
    for (const LTELevels& other : detected)
        writer.put16(other.cell.physicalCellId);
    return modemItem(kLTEConnectedMeasurementCode, writer);
}

PhoneMessage lteNeighbourMeasurement(std::span<const LTELevels> cells, std::uint32_t frameOffset)
{
    constexpr std::size_t kMostCells = 32;
    cells = cells.first(std::min(cells.size(), kMostCells));
    if (cells.empty())
        return {};
    PacketWriter writer;
    writer.put8(4).skip(3).put16(cells.front().cell.earfcn);
    writer.bits(leastPowerField(cells.front().cell), 6)
        .bits(static_cast<std::uint32_t>(cells.size() - 1), 5)
        .bits(0, 5);
    for (const LTELevels& each : cells) {
        writer.bits(each.cell.physicalCellId, 9)
            .bits(halfPower(each.totalPower, 8), 8)
            .bits(halfPower(each.power, 9), 9)
            .bits(0, 6)
            .bits(halfPower(each.averagePower, 9), 9)
            .bits(quarterQuality(each.quality), 7)
            .bits(quarterQuality(each.averageQuality), 7)
            .bits(wholeDecibels(selectionLevel(each.cell, each.averagePower), 7), 7)
            .bits(0, 2);
        writer.put16(each.cell.physicalCellId % 90U).skip(2); // frequency offset
        // The second antenna hears the same cell at the same time.
        for (int antenna = 0; antenna < 2; ++antenna)
            writer.bits((frameOffset + each.cell.physicalCellId) % 1024, 11)
                .bits(frameOffset * 30 % 307200, 19)
                .bits(0, 2);
    }
    return modemItem(kLTENeighbourMeasurementCode, writer);
}

PhoneMessage lteReselection(const LTECell& serving, const LTEReselectionCandidate& candidate)
{
    PacketWriter writer;
    writer.put8(3)
        .skip(1)
        .put16(serving.earfcn)
        .put16(serving.physicalCellId)
        .put16(1) // candidate
        .put16(candidate.priority)
        .put16(candidate.technology)
        .append(candidate.body);
    return modemItem(kLTEReselectionCode, writer);
}

LTEReselectionCandidate lteCandidate(const LTECell& cell)
{
    PacketWriter body;
    body.put16(cell.earfcn).put16(static_cast<std::uint32_t>(cell.physicalCellId) << 7);
    return {cell.priority, 0, body.take()};
}

LTEReselectionCandidate otherCandidate(unsigned turn)
{
    PacketWriter body;
    switch (turn % 4) {
    case 0:
        body.put16(10713).put16(214); // channel, scrambling code
        return {3, 1, body.take()};
    case 1:
        body.put16(62).put8(0).put8(27); // channel, band, base station identity code
        return {1, 2, body.take()};
    case 2:
        body.put8(0).skip(3).put16(283).put16(132); // band, channel, pilot
        return {2, 3, body.take()};
    default:
        body.put8(1).skip(3).put16(425).put16(96);
        return {2, 4, body.take()};
    }
}

} // namespace orvane
