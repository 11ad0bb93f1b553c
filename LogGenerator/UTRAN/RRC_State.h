#pragma once

#include "LogGenerator/Section.h"

namespace orvane
{

// "RRC Info": the state of the radio resource control.
class RRC_State final : public Section
{
public:
    RRC_State();

private:
    void decode(PacketView packet, const PacketLayout& layout) override;
};

} // namespace orvane
