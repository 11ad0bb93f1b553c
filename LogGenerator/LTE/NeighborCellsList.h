#pragma once

#include "LogGenerator/Section.h"
#include "platform/base/PropertyValue.h"

namespace orvane
{

// "Neighbor Cells List": the neighbours measured while idle. Logs what it shows.
class NeighborCellsList final : public ListSection
{
public:
    NeighborCellsList();

private:
    std::vector<PropertyValue> elements(PacketView packet, const PacketLayout& layout) override;
};

} // namespace orvane
