#pragma once

#include "LogGenerator/Section.h"

namespace orvane
{

// "PDP Context Info": the packet-data contexts as the telephony server lists them, with keys and
// values of its own.
class PDPContextList final : public ListSection
{
public:
    PDPContextList();

private:
    void decode(PacketView packet, const PacketLayout& layout) override;
};

} // namespace orvane
