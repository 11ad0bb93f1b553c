#pragma once

#include "LogGenerator/Section.h"

namespace orvane
{

// "Serving Cell Info" of the UTRAN view: the serving cell's identity and channels, from a modem
// packet and from the telephony server's cells.
class UTRANServingCellInfo final : public Section
{
public:
    UTRANServingCellInfo();

private:
    void decode(PacketView packet, const PacketLayout& layout) override;
};

} // namespace orvane
