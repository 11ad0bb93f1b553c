#include "LogGenerator/TextReadings.h"

#include "LogGenerator/MessageTime.h"

#include <algorithm>
#include <string>

namespace orvane
{

namespace
{

// As they stand behind a number.
constexpr std::string_view kSuffixes[] = {
    "", " dB", " dBm", " MHz", " ms", " sec", " kbps", "%", " × 64chips",
};

// How many digits the text begins with.
std::size_t digitsAt(std::string_view text)
{
    return std::min(text.find_first_not_of("0123456789"), text.size());
}

// The length of the decimal number that the text begins with; 0 where there is none.
std::size_t numberLength(std::string_view text)
{
    const std::size_t sign = text.starts_with('-') || text.starts_with('+') ? 1 : 0;
    const std::size_t whole = digitsAt(text.substr(sign));
    if (whole == 0)
        return 0;
    const std::size_t length = sign + whole;
    if (length == text.size() || text[length] != '.')
        return length;
    const std::size_t fraction = digitsAt(text.substr(length + 1));
    return fraction == 0 ? 0 : length + 1 + fraction;
}

} // namespace

std::optional<TextReading> textReading(std::string_view text)
{
    const std::size_t length = numberLength(text);
    if (length == 0)
        return std::nullopt;
    std::string_view suffix = text.substr(length);
    if (std::find(std::begin(kSuffixes), std::end(kSuffixes), suffix) == std::end(kSuffixes))
        return std::nullopt;
    std::string_view number = text.substr(0, length);
    if (number.starts_with('+'))
        number.remove_prefix(1);
    if (suffix.starts_with(' '))
        suffix.remove_prefix(1);
    return TextReading{std::string(text), std::string(number), std::string(suffix),
                       MessageTime::current()};
}

PropertyValue withTextReadings(const PropertyValue& tree)
{
    if (const PropertyDictionary* dictionary = tree.asDictionary()) {
        PropertyValue copy = PropertyValue::newDictionary();
        for (const auto& [key, value] : *dictionary)
            copy.asDictionary()->set(key, withTextReadings(value));
        return copy;
    }
    if (const PropertyArray* array = tree.asArray()) {
        PropertyValue copy = PropertyValue::newArray();
        for (const PropertyValue& element : *array)
            copy.asArray()->append(withTextReadings(element));
        return copy;
    }
    const std::string* text = tree.asString();
    auto reading = text ? textReading(*text) : std::nullopt;
    return reading ? PropertyValue::textReading(std::move(*reading)) : tree;
}

} // namespace orvane
