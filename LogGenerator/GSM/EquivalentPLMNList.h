#pragma once

#include "LogGenerator/Section.h"
#include "platform/base/PropertyValue.h"

namespace orvane
{

// "Equivalent PLMN List": the networks that count as the registered one.
class EquivalentPLMNList final : public ListSection
{
public:
    EquivalentPLMNList();

private:
    std::vector<PropertyValue> elements(PacketView packet, const PacketLayout& layout) override;
};

} // namespace orvane
