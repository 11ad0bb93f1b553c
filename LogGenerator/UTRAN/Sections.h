#pragma once

#include "LogGenerator/Section.h"
#include "platform/base/PropertyValue.h"

namespace orvane
{

// The UTRAN sections. Most of them are tables alone: one source each, and one line here.
// clang-format off
// "Neighbor Cell List": the neighbours of the same technology.
struct UTRANNeighbhorMeasurements final : ListSection { UTRANNeighbhorMeasurements(); };
// "TRCH BLER": the block error rate of each transport channel.
struct TRCHBLERMeasurement final : ListSection { TRCHBLERMeasurement(); };
// clang-format on

// "RRC Info": the state of the radio resource control.
class RRC_State final : public Section
{
public:
    RRC_State();

private:
    void decode(PacketView packet, const PacketLayout& layout) override;
};

// "Serving Cell Info" of the UTRAN view: the serving cell's identity and channels, from a modem
// packet and from the telephony server's cells.
class UTRANServingCellInfo final : public Section
{
public:
    UTRANServingCellInfo();

private:
    void decode(PacketView packet, const PacketLayout& layout) override;
};

// "GSM Neighbor Cell List": decodes the GSM neighbours but shows none of them.
class GSMNeighbhorMeasurements final : public ListSection
{
public:
    GSMNeighbhorMeasurements();

    // The rows of a packet's cells, which the list is not given.
    static std::vector<PropertyValue> decodedCells(PacketView packet);

private:
    void decode(PacketView packet, const PacketLayout& layout) override;
};

// "CCTRCH SIR": the signal-to-interference ratios of each coded composite transport channel.
class CCTRCHSIRMeasurement final : public ListSection
{
public:
    CCTRCHSIRMeasurement();

private:
    void fill(ListElements& elements, PacketView packet, const PacketLayout& layout) override;
};

} // namespace orvane
