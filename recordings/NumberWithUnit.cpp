#include "recordings/NumberWithUnit.h"

#include "platform/base/DecimalNumber.h"

#include <algorithm>

namespace orvane
{

std::optional<NumberWithUnit> numberWithUnit(std::string_view text)
{
    const auto skipBlanks = [](std::string_view from) {
        return from.substr(std::min(from.find_first_not_of(' '), from.size()));
    };
    text = skipBlanks(text);
    if (text.starts_with('+'))
        text.remove_prefix(1);
    const std::string_view number = text.substr(0, text.find_first_of(" %"));
    if (number.starts_with('+') || !decimalNumber(number))
        return std::nullopt;
    const std::string_view unit = skipBlanks(text.substr(number.size()));
    if (!unit.empty() && unit.front() >= '0' && unit.front() <= '9')
        return std::nullopt;
    return NumberWithUnit{number, unit};
}

void CommonUnit::take(std::string_view text)
{
    if (text.empty() || _seen == Seen::Others)
        return;
    const auto parts = numberWithUnit(text);
    if (!parts || (_seen == Seen::OneUnit && parts->unit != _unit)) {
        _seen = Seen::Others;
    } else if (_seen == Seen::Nothing) {
        _seen = Seen::OneUnit;
        _unit = parts->unit;
    }
}

std::optional<std::string_view> CommonUnit::unit() const
{
    return _seen == Seen::OneUnit ? std::optional<std::string_view>(_unit) : std::nullopt;
}

} // namespace orvane
