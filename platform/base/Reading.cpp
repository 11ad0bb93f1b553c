#include "platform/base/Reading.h"

#include <bit>
#include <charconv>
#include <cmath>
#include <cstdlib>

namespace orvane
{

double valueOfBits(std::int64_t bits) { return std::bit_cast<double>(bits); }

std::int64_t bitsOfValue(double value) { return std::bit_cast<std::int64_t>(value); }

void appendWhole(std::string& to, std::int64_t value)
{
    char text[20];
    to.append(text, std::to_chars(text, text + sizeof text, value).ptr);
}

void appendFixed(std::string& to, double value, int digits)
{
    // The longest double has 309 digits before its point.
    char text[1 + 309 + 1 + kMostDigits];
    to.append(text,
              std::to_chars(text, text + sizeof text, value, std::chars_format::fixed, digits).ptr);
}

std::int64_t Format::wholeValue(std::int64_t raw) const
{
    const std::int64_t value = (raw & _whole.mask) * _whole.factor + _whole.offset;
    switch (_whole.narrowing) {
    case Narrowing::Signed32:
        return static_cast<std::int32_t>(value);
    case Narrowing::Unsigned32:
        return static_cast<std::uint32_t>(value);
    case Narrowing::None:
        break;
    }
    return value;
}

double Format::fixedValue(std::int64_t raw) const
{
    if (_value)
        return _value(raw);
    return static_cast<double>(raw) * _scale.factor / _scale.divisor + _scale.offset;
}

bool Format::knowsText(std::int64_t raw) const
{
    if (isSpecial(raw))
        return true;
    return _kind == Kind::Named ? nameOf(_names, raw, nullptr) != nullptr
                                : _rowText && _rowText(raw);
}

void Format::appendText(std::string& to, std::int64_t raw) const
{
    if (isSpecial(raw)) {
        to += _specialText;
        return;
    }
    switch (_kind) {
    case Kind::Whole: {
        const std::int64_t value = wholeValue(raw);
        to += _prefix;
        if (_showsPlus && value >= 0)
            to += '+';
        appendWhole(to, value);
        to += _suffix;
        break;
    }
    case Kind::Fixed: {
        const double value = fixedValue(raw);
        to += _prefix;
        const std::size_t start = to.size();
        if (_showsPlus && !std::signbit(value))
            to += '+';
        appendFixed(to, value, _digits);
        if (to.size() - start < _width)
            to.insert(start, _width - (to.size() - start), ' ');
        to += _suffix;
        break;
    }
    case Kind::Named:
        if (const char* name = nameOf(_names, raw, nullptr))
            (to += name) += _suffix;
        else if (_text)
            to += _text(raw);
        else if (_fallback)
            to += _fallback;
        break;
    case Kind::Text:
        to += _text ? _text(raw) : _rowText(raw).value_or("");
        break;
    }
}

RowText Format::operator()(std::int64_t raw) const
{
    if (!writes(raw))
        return std::nullopt;
    RowText text(std::in_place);
    appendText(*text, raw);
    return text;
}

std::optional<std::string> Format::numberText(std::int64_t raw) const
{
    if (!showsNumber(raw))
        return std::nullopt;
    if (_kind == Kind::Named && _isMeasure) {
        const char* name = nameOf(_names, raw, nullptr);
        return name ? std::optional<std::string>(name) : std::nullopt;
    }
    std::string text;
    if (_kind == Kind::Fixed) {
        const double value = fixedValue(raw);
        if (!std::isfinite(value))
            return std::nullopt;
        appendFixed(text, value, _digits);
    } else {
        appendWhole(text, _kind == Kind::Whole ? wholeValue(raw) : raw);
    }
    return text;
}

std::optional<double> Format::number(std::int64_t raw) const
{
    if (!showsNumber(raw))
        return std::nullopt;
    if (_kind == Kind::Named && _isMeasure) {
        const char* name = nameOf(_names, raw, nullptr);
        return name ? std::optional<double>(std::strtod(name, nullptr)) : std::nullopt;
    }
    if (_kind != Kind::Fixed)
        return static_cast<double>(_kind == Kind::Whole ? wholeValue(raw) : raw);
    const double value = fixedValue(raw);
    return std::isfinite(value) ? std::optional<double>(value) : std::nullopt;
}

std::string Reading::text() const
{
    std::string text;
    description->format->appendText(text, raw);
    return text;
}

} // namespace orvane
