#pragma once

#include "LogGenerator/Section.h"
#include "platform/base/PropertyValue.h"

#include <map>
#include <string>

namespace orvane
{

// "Neighboring Cells": the neighbours that the modem measured, or that the telephony server
// reports, whichever came last.
class NeighboringCells final : public ListSection
{
public:
    NeighboringCells();

private:
    void decode(PacketView packet, const PacketLayout& layout) override;
    std::vector<PropertyValue> elements(PacketView packet, const PacketLayout& layout) override;
    [[nodiscard]] PropertyValue keptValues() const override;
    void takeKeptValues(const PropertyValue& values) override;
    void decodeBsicList(PacketView packet);

    // Decimal texts, from the last BSIC list.
    std::map<std::string, std::string> arfcnToBsic;
};

} // namespace orvane
