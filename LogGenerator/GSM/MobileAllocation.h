#pragma once

#include "LogGenerator/Section.h"

namespace orvane
{

// "Mobile Allocation": the hopping sequence and its channels.
class MobileAllocation final : public Section
{
public:
    MobileAllocation();

private:
    void decode(PacketView packet, const PacketLayout& layout) override;
};

} // namespace orvane
