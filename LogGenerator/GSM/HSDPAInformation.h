#pragma once

#include "LogGenerator/Section.h"

namespace orvane
{

// "HSDPA Info": the carrier configuration, and what each HARQ process of the primary and of the
// secondary carrier received.
class HSDPAInformation final : public Section
{
public:
    HSDPAInformation();

private:
    void decode(PacketView packet, const PacketLayout& layout) override;
};

} // namespace orvane
