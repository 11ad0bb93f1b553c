#pragma once

#include "LogGenerator/Section.h"
#include "platform/base/PropertyValue.h"

namespace orvane
{

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

} // namespace orvane
