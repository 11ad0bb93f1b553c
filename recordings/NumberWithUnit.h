#pragma once

#include <optional>
#include <string>
#include <string_view>

namespace orvane
{

// A text such as "-97.50 dBm", "12" or "3.21%", taken apart.
struct NumberWithUnit {
    std::string_view number; // without a plus sign
    std::string_view unit;   // empty where there is none
};

// Nothing for any other text: a number stands alone, before a blank or before a "%", and what
// follows does not begin with a digit. The parts are the text's.
std::optional<NumberWithUnit> numberWithUnit(std::string_view text);

// Whether all texts of a row are numbers of one unit. Empty texts do not count.
class CommonUnit
{
public:
    void take(std::string_view text);
    // Nothing where they are not, or where there was no number.
    [[nodiscard]] std::optional<std::string_view> unit() const;

private:
    enum class Seen { Nothing, OneUnit, Others };
    Seen _seen = Seen::Nothing;
    std::string _unit;
};

} // namespace orvane
