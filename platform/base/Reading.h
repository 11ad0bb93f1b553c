#pragma once

#include <cstdint>
#include <limits>
#include <optional>
#include <span>
#include <string>
#include <string_view>

namespace orvane
{

// The name of one of a field's values.
struct ValueName {
    std::int64_t value;
    const char* name;
};

// The value's name, or the fallback for one that the table lacks.
constexpr const char* nameOf(std::span<const ValueName> table, std::int64_t value,
                             const char* fallback)
{
    for (const ValueName& entry : table)
        if (entry.value == value)
            return entry.name;
    return fallback;
}

// The text of a row, or nullopt when the row is not to be written.
using RowText = std::optional<std::string>;

// How a raw number is shown, as data: a linear scale with unit and digits, a table of names, or a
// function for the few odd ones. A suffix such as " dBm" follows the number; without its blank it
// is the unit.
class Format
{
public:
    using TextFunction = std::string (*)(std::int64_t raw);
    using RowTextFunction = RowText (*)(std::int64_t raw);
    using ValueFunction = double (*)(std::int64_t raw);

    enum class Kind : std::uint8_t {
        Whole, // "%d" of a whole number
        Fixed, // "%.*f"
        Named, // the name of the raw number in a table
        Text,  // what a function makes
    };
    // What "%d" or "%u" makes of a number that is wider than an int.
    enum class Narrowing : std::uint8_t { Signed32, Unsigned32, None };

    // value = (raw & mask) * factor + offset, then narrowed.
    struct WholeScale {
        std::int64_t factor = 1;
        std::int64_t offset = 0;
        std::int64_t mask = -1;
        Narrowing narrowing = Narrowing::Signed32;
    };
    // value = raw * factor / divisor + offset, each step rounded to a double.
    struct Scale {
        double factor = 1;
        double divisor = 1;
        double offset = 0;
    };

    // "%d".
    constexpr Format() = default;
    // The text is what the function returns; such a format has no number.
    explicit constexpr Format(TextFunction text) : _kind(Kind::Text), _text(text) {}
    // The same for a function that returns nullopt where the row is not to be written.
    explicit constexpr Format(RowTextFunction text) : _kind(Kind::Text), _rowText(text) {}

    static constexpr Format whole(std::string_view suffix, const WholeScale& scale)
    {
        Format format;
        format._whole = scale;
        format._suffix = suffix;
        return format;
    }
    static constexpr Format fixed(const Scale& scale, int digits, std::string_view suffix)
    {
        Format format;
        format._kind = Kind::Fixed;
        format._scale = scale;
        format._digits = static_cast<std::uint8_t>(digits);
        format._suffix = suffix;
        return format;
    }
    static constexpr Format named(std::span<const ValueName> names, const char* fallback)
    {
        Format format;
        format._kind = Kind::Named;
        format._names = names;
        format._fallback = fallback;
        return format;
    }

    // This raw number shows the text. Unless the format is one of names, it stands for no number.
    [[nodiscard]] constexpr Format withText(std::int64_t raw, const char* text) const
    {
        Format format = *this;
        format._special = raw;
        format._specialText = text;
        return format;
    }
    // "%+d" or "%+.*f".
    [[nodiscard]] constexpr Format withPlus() const
    {
        Format format = *this;
        format._showsPlus = true;
        return format;
    }
    // A text before the number.
    [[nodiscard]] constexpr Format withPrefix(std::string_view prefix) const
    {
        Format format = *this;
        format._prefix = prefix;
        return format;
    }
    // "%*.*f".
    [[nodiscard]] constexpr Format withWidth(int width) const
    {
        Format format = *this;
        format._width = static_cast<std::uint8_t>(width);
        return format;
    }
    // Of a table whose names are numbers: what follows each, but not the fallback.
    [[nodiscard]] constexpr Format withSuffix(std::string_view suffix) const
    {
        Format format = *this;
        format._suffix = suffix;
        format._isMeasure = true;
        return format;
    }
    // The unit, where it is not just the suffix without its blank.
    [[nodiscard]] constexpr Format withUnit(std::string_view unit) const
    {
        Format format = *this;
        format._unit = unit;
        return format;
    }
    // Of a table: makes the text of a raw number that the table lacks.
    [[nodiscard]] constexpr Format withFallback(TextFunction text) const
    {
        Format format = *this;
        format._text = text;
        return format;
    }
    // Of a fixed-point format: the value in place of the linear scale.
    [[nodiscard]] constexpr Format withValue(ValueFunction value) const
    {
        Format format = *this;
        format._value = value;
        return format;
    }

    // Whether a row with this raw number is written at all. Makes no text, except for a
    // RowTextFunction.
    [[nodiscard]] bool writes(std::int64_t raw) const { return alwaysWrites() || knowsText(raw); }
    // Whether that holds for every raw number.
    [[nodiscard]] constexpr bool alwaysWrites() const
    {
        return _kind == Kind::Named ? _fallback || _text : _kind != Kind::Text || _text;
    }
    void appendText(std::string& to, std::int64_t raw) const;
    // The text, or nullopt when the row is not written.
    RowText operator()(std::int64_t raw) const;

    // Whether the format shows numbers with an optional unit, as opposed to names and texts.
    [[nodiscard]] bool isMeasure() const
    {
        return _kind == Kind::Whole || _kind == Kind::Fixed || _isMeasure;
    }
    // Whether number() has one; makes no text. For formats of a linear scale or a table.
    [[nodiscard]] bool showsNumber(std::int64_t raw) const
    {
        return _kind != Kind::Text && (!isSpecial(raw) || _kind == Kind::Named);
    }
    // The number behind the text, with the digits of the text and without a plus sign. Of a name it
    // is the raw number. nullopt where the text stands for no (finite) number.
    [[nodiscard]] std::optional<std::string> numberText(std::int64_t raw) const;
    // The same as a number, not rounded to the digits of the text.
    [[nodiscard]] std::optional<double> number(std::int64_t raw) const;
    // "dBm"; empty where there is none.
    [[nodiscard]] constexpr std::string_view unit() const
    {
        if (!_unit.empty())
            return _unit;
        return _suffix.substr(_suffix.starts_with(' ') ? 1 : 0);
    }

private:
    [[nodiscard]] bool knowsText(std::int64_t raw) const;
    [[nodiscard]] bool isSpecial(std::int64_t raw) const { return _specialText && raw == _special; }
    [[nodiscard]] std::int64_t wholeValue(std::int64_t raw) const;
    [[nodiscard]] double fixedValue(std::int64_t raw) const;

    Kind _kind = Kind::Whole;
    bool _showsPlus = false;
    bool _isMeasure = false;
    std::uint8_t _digits = 0;
    std::uint8_t _width = 0;
    WholeScale _whole;
    Scale _scale;
    std::string_view _prefix;
    std::string_view _suffix;
    std::string_view _unit;
    std::span<const ValueName> _names;
    const char* _fallback = nullptr;
    const char* _specialText = nullptr;
    std::int64_t _special = 0;
    TextFunction _text = nullptr;
    RowTextFunction _rowText = nullptr;
    ValueFunction _value = nullptr;
};

// A row that raw numbers fill: its name, and how they are shown. Static data, which outlives every
// reading made with it.
struct RowDescription {
    const char* row;
    const Format* format;
};

constexpr std::int64_t kNoReadingTime = std::numeric_limits<std::int64_t>::min();

// What a packet or a server's item said about a row.
struct Reading {
    const RowDescription* description; // not null
    std::int64_t raw;
    std::int64_t time = kNoReadingTime; // of the message, milliseconds since 1970 in UTC

    [[nodiscard]] std::string text() const;
    [[nodiscard]] std::optional<std::string> numberText() const
    {
        return description->format->numberText(raw);
    }
    friend bool operator==(const Reading&, const Reading&) = default;
};

// A number that came as a text with an optional unit, as a snapshot's and the cell monitor's do.
// The text stays as it came.
struct TextReading {
    std::string text;
    std::string number; // without a plus sign
    std::string unit;   // empty where there is none
    std::int64_t time = kNoReadingTime;
};

// For Format::withValue: raw numbers that are the bits of a double, and the inverse.
double valueOfBits(std::int64_t bits);
std::int64_t bitsOfValue(double value);

// Appends what printf makes of "%d" and "%.*f" (at most kMostDigits), at a quarter of its cost.
constexpr int kMostDigits = 16;
void appendWhole(std::string& to, std::int64_t value);
void appendFixed(std::string& to, double value, int digits);

} // namespace orvane
