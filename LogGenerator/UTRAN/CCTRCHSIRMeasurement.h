#pragma once

#include "LogGenerator/Section.h"
#include "platform/base/PropertyValue.h"

namespace orvane
{

// "CCTRCH SIR": the signal-to-interference ratios of each coded composite transport channel.
class CCTRCHSIRMeasurement final : public ListSection
{
public:
    CCTRCHSIRMeasurement();

private:
    std::vector<PropertyValue> elements(PacketView packet, const PacketLayout& layout) override;
};

} // namespace orvane
