#include "recordings/Measure.h"

namespace orvane
{

std::optional<Measure> measureOf(const PropertyValue& row)
{
    if (const TextReading* reading = row.asTextReading())
        return Measure{reading->number, reading->unit};
    const Reading* reading = row.asReading();
    if (!reading || !reading->description->format->isMeasure())
        return std::nullopt;
    auto number = reading->numberText();
    if (!number)
        return std::nullopt;
    return Measure{std::move(*number), std::string(reading->description->format->unit())};
}

void CommonUnit::take(const std::optional<Measure>& measure)
{
    if (_seen == Seen::Others)
        return;
    if (!measure || (_seen == Seen::OneUnit && measure->unit != _unit)) {
        _seen = Seen::Others;
    } else if (_seen == Seen::Nothing) {
        _seen = Seen::OneUnit;
        _unit = measure->unit;
    }
}

std::optional<std::string_view> CommonUnit::unit() const
{
    return _seen == Seen::OneUnit ? std::optional<std::string_view>(_unit) : std::nullopt;
}

} // namespace orvane
