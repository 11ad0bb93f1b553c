#pragma once

#include "LogGenerator/Section.h"

namespace orvane
{

// "Serving Cell Info" of the LTE view: the serving cell's identity, channels and bandwidths, from
// two modem packets and from the telephony server's cells.
class LTEServingCellInfo final : public Section
{
public:
    LTEServingCellInfo();

private:
    void decode(PacketView packet, const PacketLayout& layout) override;
};

} // namespace orvane
