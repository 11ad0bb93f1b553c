#pragma once

#include "platform/base/PropertyValue.h"

#include <optional>
#include <string>

namespace orvane
{

// The number that a row measures: "-97.50" and "dBm", "12" and "".
struct Measure {
    std::string number; // with the digits that the row shows, without a plus sign
    std::string unit;   // empty where there is none
};

// nullopt for a row that shows a name or any other text.
std::optional<Measure> measureOf(const PropertyValue& row);

// Whether all values of a row are numbers of one unit.
class CommonUnit
{
public:
    void take(const std::optional<Measure>& measure);
    // nullopt where they are not, or where there was no value.
    [[nodiscard]] std::optional<std::string_view> unit() const;

private:
    enum class Seen { Nothing, OneUnit, Others };

    Seen _seen = Seen::Nothing;
    std::string _unit;
};

} // namespace orvane
