#pragma once

#include "LogGenerator/Section.h"
#include "platform/base/PropertyValue.h"

namespace orvane
{

// "Reselection Candidates List": the candidates, each with the fields of its technology.
class ReselectionCandidatesList final : public ListSection
{
public:
    ReselectionCandidatesList();

private:
    std::vector<PropertyValue> elements(PacketView packet, const PacketLayout& layout) override;
};

} // namespace orvane
