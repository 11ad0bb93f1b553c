#pragma once

#include "LogGenerator/Section.h"
#include "platform/base/PropertyValue.h"

namespace orvane
{

// "Active Set": the cells that the receiver combines, with their measured levels.
class ActiveSet final : public ListSection
{
public:
    ActiveSet();

private:
    std::vector<PropertyValue> elements(PacketView packet, const PacketLayout& layout) override;
};

} // namespace orvane
