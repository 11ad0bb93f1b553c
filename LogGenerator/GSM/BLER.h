#pragma once

#include "LogGenerator/Section.h"

namespace orvane
{

// "BLER": how many blocks of each transport channel came with a wrong checksum.
class BLER final : public Section
{
public:
    BLER();

private:
    void decode(PacketView packet, const PacketLayout& layout) override;
};

} // namespace orvane
