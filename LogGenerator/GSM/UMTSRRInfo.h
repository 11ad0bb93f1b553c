#pragma once

#include "LogGenerator/Section.h"

namespace orvane
{

// "UMTS RR Info": RRC state, identity and frequencies of the serving cell, ciphering and the mean
// uplink power.
class UMTSRRInfo final : public Section
{
public:
    UMTSRRInfo();

private:
    void decode(PacketView packet, const PacketLayout& layout) override;
};

} // namespace orvane
