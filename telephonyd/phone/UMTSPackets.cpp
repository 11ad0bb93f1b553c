#include "telephonyd/phone/UMTSPackets.h"

#include "telephonyd/phone/ModemItem.h"

#include <cmath>

namespace orvane
{

namespace
{

constexpr std::uint16_t kUplinkBelowDownlink = 400; // channel numbers

std::uint32_t count(std::size_t records) { return static_cast<std::uint32_t>(records); }
// Whole numbers below zero go into fields in two's complement.
std::uint32_t rounded(double value) { return static_cast<std::uint32_t>(std::lround(value)); }

// Gain control counts tenths of a decibel from 51.2 dB below its zero, which stands for that power.
std::uint32_t gain(double power, double zeroPower)
{
    return rounded(10 * (power - zeroPower) - 512);
}

// The energy of a chip as a share of all: 2^19 would be all of it.
std::uint32_t energyShare(double decibels)
{
    return static_cast<std::uint32_t>(std::lround(0x1p19 * std::pow(10, decibels / 10)));
}

} // namespace

PhoneMessage umtsActiveSet(double totalPower, std::span<const UMTSLevel> cells)
{
    constexpr double kReceiverZero = -106;
    PacketWriter writer;
    writer.put16(gain(totalPower, kReceiverZero)).put8(count(cells.size()));
    for (const UMTSLevel& each : cells)
        writer.skip(7)
            .bits(each.cell.code, 13)
            .bits(static_cast<std::uint32_t>(each.set), 3)
            .skip(6);
    // What the receiver's fingers made of each cell: of three values the first counts.
    for (const UMTSLevel& each : cells)
        writer.skip(32).put32(energyShare(each.quality)).skip(8);
    return modemItem(kUMTSActiveSetCode, writer);
}

PhoneMessage gsmRanking(std::span<const GSMLevel> cells)
{
    constexpr double kOffset = 7; // by which GSM has to be better
    PacketWriter writer;
    writer.put8(0).put8(count(cells.size()));
    for (const GSMLevel& each : cells)
        writer.put16(each.cell.channel)
            .put16(each.cell.code)
            .put8(rounded(each.power))
            .put16(rounded(each.power - kOffset));
    return modemItem(kUMTSRankingCode, writer);
}

PhoneMessage umtsRanking(std::span<const UMTSLevel> cells)
{
    constexpr double kPowerZero = -21;
    PacketWriter writer;
    // The first record's channel, code, power and rank power are the GSM cell's as well.
    writer.put8(count(cells.size())).put8(cells.empty() ? 0 : 1);
    for (const UMTSLevel& each : cells)
        writer.put16(each.cell.channel)
            .put16(each.cell.code)
            .put8(rounded(each.power - kPowerZero))
            .put16(rounded(each.power))
            .put8(rounded(2 * each.quality))
            .put16(rounded(each.rank));
    return modemItem(kUMTSRankingCode, writer);
}

PhoneMessage umtsRadioState(RadioState state)
{
    PacketWriter writer;
    writer.put8(static_cast<std::uint32_t>(state));
    return modemItem(kUMTSRadioStateCode, writer);
}

PhoneMessage umtsServingCell(const UMTSTownCell& cell)
{
    PacketWriter writer;
    writer.put32(cell.channel - kUplinkBelowDownlink)
        .put32(cell.channel)
        .put32(cell.cellIdentity)
        .put16(cell.routingArea) // registration areas are laid out like routing areas
        .skip(2);
    return modemItem(kUMTSServingCellCode, writer);
}

PhoneMessage umtsCiphering(bool isOn)
{
    PacketWriter writer;
    writer.put8(isOn ? 1 : 0).skip(5);
    return modemItem(kUMTSCipheringCode, writer);
}

PhoneMessage umtsTransmitPower(std::span<const double> powers)
{
    constexpr double kTransmitterZero = -70;
    PacketWriter writer;
    writer.skip(1).put8(count(powers.size())).skip(1);
    for (const double power : powers)
        writer.skip(4).put16(gain(power, kTransmitterZero)).skip(8);
    return modemItem(kUMTSTransmitPowerCode, writer);
}

PhoneMessage umtsBlockErrors(std::span<const TransportBlocks> channels)
{
    constexpr std::uint32_t kWindow = 100;
    PacketWriter writer;
    writer.put8(count(channels.size())).put16(kWindow);
    for (const TransportBlocks& each : channels)
        writer.put8(each.channel).put32(each.received).put32(each.damaged);
    return modemItem(kUMTSBlockErrorsCode, writer);
}

PhoneMessage umtsFastDownlink(std::uint16_t subFrames, std::span<const DownlinkProcess> primary,
                              std::span<const DownlinkProcess> secondary)
{
    constexpr std::uint32_t kVersion = 2;
    constexpr std::uint32_t kSingleCarrier = 0;
    constexpr std::uint32_t kDualCarrier = 2;
    // The secondary carrier's processes begin 162 bytes per primary one after the first of those,
    // which take 9 bytes each themselves.
    const std::size_t gap = (162 - 9) * primary.size();
    PacketWriter writer;
    writer.put8(kVersion)
        .bits(subFrames, 10)
        .bits(secondary.empty() ? kSingleCarrier : kDualCarrier, 2)
        .bits(0, 4)
        .put8(count(primary.size()))
        .put8(count(secondary.size()));
    const auto put = [&writer](std::span<const DownlinkProcess> processes) {
        for (const DownlinkProcess& each : processes)
            writer.put8(each.number)
                .put32(each.bits)
                .put16(each.transmissions)
                .put16(each.blockErrors);
    };
    put(primary);
    if (!secondary.empty()) {
        writer.skip(gap);
        put(secondary);
    }
    return modemItem(kUMTSFastDownlinkCode, writer);
}

} // namespace orvane
