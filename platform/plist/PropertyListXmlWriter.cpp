#include "platform/base/Bytes.h"
#include "platform/base/Calendar.h"
#include "platform/base/PropertyValue.h"
#include "platform/base/Utf8.h"
#include "platform/plist/PropertyList.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>
#include <cstdio>

namespace orvane
{

namespace
{

constexpr std::size_t kBytesADataLine = 48; // 64 characters

// No line is indented further, so that a list of many deep values does not become mostly tabs.
constexpr std::size_t kIndentLimit = 32;

// How a character is written: null for unchanged, empty if it cannot be written.
using Escapes = std::array<const char*, 256>;

constexpr Escapes escapes()
{
    Escapes table{};
    for (std::size_t control = 0; control < 0x20; ++control)
        table[control] = "";
    table['\t'] = nullptr;
    table['\n'] = nullptr;
    table['\r'] = "&#13;"; // read back as a line feed otherwise
    table['&'] = "&amp;";
    table['<'] = "&lt;";
    table['>'] = "&gt;";
    return table;
}

constexpr Escapes kEscapes = escapes();

void appendBase64(std::string& to, ByteView bytes)
{
    constexpr char kAlphabet[] = "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789+/";
    for (std::size_t at = 0; at < bytes.size(); at += 3) {
        const ByteView group = bytes.subspan(at, std::min<std::size_t>(3, bytes.size() - at));
        const std::uint32_t second = group.size() > 1 ? group[1] : 0;
        const std::uint32_t third = group.size() > 2 ? group[2] : 0;
        const std::uint32_t bits = static_cast<std::uint32_t>(group[0]) << 16 | second << 8 | third;
        to += kAlphabet[bits >> 18];
        to += kAlphabet[bits >> 12 & 63];
        to += group.size() > 1 ? kAlphabet[bits >> 6 & 63] : '=';
        to += group.size() > 2 ? kAlphabet[bits & 63] : '=';
    }
}

// Each operation returns whether XML can hold what it was given.
class XmlWriter
{
public:
    bool writeList(const PropertyValue& root)
    {
        _text = "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n<plist version=\"1.0\">\n";
        if (!write(root))
            return false;
        _text += "</plist>\n";
        return true;
    }
    std::string takeText() { return std::move(_text); }

private:
    bool write(const PropertyValue& value);
    bool writeDictionary(const PropertyDictionary& dictionary);
    bool writeArray(const PropertyArray& array);
    bool writeText(const char* element, std::string_view text);
    bool writeReal(double number);
    bool writeLargeNumber(const PropertyLargeNumber& number);
    bool writeData(const Bytes& bytes);
    bool writeDate(PropertyDate date);
    bool writeLine(std::string_view line);
    bool openContainer(const char* element);
    void closeContainer(const char* element);
    void indent() { _text.append(std::min(_depth, kIndentLimit), '\t'); }

    std::string _text;
    std::size_t _depth = 0;
};

bool XmlWriter::write(const PropertyValue& value)
{
    switch (value.type()) {
    case PropertyValue::Type::Dictionary:
        return writeDictionary(*value.asDictionary());
    case PropertyValue::Type::Array:
        return writeArray(*value.asArray());
    case PropertyValue::Type::String:
        return writeText("string", *value.asString());
    case PropertyValue::Type::Reading:
    case PropertyValue::Type::TextReading:
        return writeText("string", *value.text());
    case PropertyValue::Type::Integer:
        return writeLine("<integer>" + std::to_string(*value.asInteger()) + "</integer>");
    case PropertyValue::Type::Real:
        return writeReal(*value.asReal());
    case PropertyValue::Type::LargeNumber:
        return writeLargeNumber(*value.asLargeNumber());
    case PropertyValue::Type::Boolean:
        return writeLine(*value.asBoolean() ? "<true/>" : "<false/>");
    case PropertyValue::Type::Data:
        return writeData(*value.asData());
    case PropertyValue::Type::Date:
        return writeDate(*value.asDate());
    case PropertyValue::Type::Absent:
        break;
    }
    return false;
}

bool XmlWriter::writeDictionary(const PropertyDictionary& dictionary)
{
    if (dictionary.empty() && _depth < kPropertyListDepthLimit)
        return writeLine("<dict/>");
    if (!openContainer("dict"))
        return false;
    for (const auto& [key, value] : dictionary)
        if (!writeText("key", key) || !write(value))
            return false;
    closeContainer("dict");
    return true;
}

bool XmlWriter::writeArray(const PropertyArray& array)
{
    if (array.empty() && _depth < kPropertyListDepthLimit)
        return writeLine("<array/>");
    if (!openContainer("array"))
        return false;
    for (const PropertyValue& element : array)
        if (!write(element))
            return false;
    closeContainer("array");
    return true;
}

bool XmlWriter::openContainer(const char* element)
{
    // A deeper list could not be read again. This also ends a container that holds itself.
    if (_depth == kPropertyListDepthLimit)
        return false;
    writeLine(std::string("<") + element + ">");
    ++_depth;
    return true;
}

void XmlWriter::closeContainer(const char* element)
{
    --_depth;
    writeLine(std::string("</") + element + ">");
}

bool XmlWriter::writeText(const char* element, std::string_view text)
{
    if (!isValidUtf8(text))
        return false;
    indent();
    ((_text += '<') += element) += '>';
    std::size_t written = 0;
    for (std::size_t at = 0; at < text.size(); ++at) {
        const char* const escape = kEscapes[static_cast<unsigned char>(text[at])];
        const bool isNoncharacter = text[at] == '\xEF' && (text.substr(at, 3) == "\xEF\xBF\xBE" ||
                                                           text.substr(at, 3) == "\xEF\xBF\xBF");
        if (isNoncharacter || (escape && *escape == '\0'))
            return false;
        if (!escape)
            continue;
        _text += text.substr(written, at - written);
        _text += escape;
        written = at + 1;
    }
    _text += text.substr(written);
    ((_text += "</") += element) += ">\n";
    return true;
}

bool XmlWriter::writeReal(double number)
{
    // to_chars would show the sign of a not-a-number.
    if (std::isnan(number))
        return writeLine("<real>nan</real>");
    char digits[40];
    const auto [end, fault] = std::to_chars(digits, digits + sizeof digits, number);
    return fault == std::errc() && writeLine("<real>" + std::string(digits, end) + "</real>");
}

bool XmlWriter::writeLargeNumber(const PropertyLargeNumber& number)
{
    return writeText(number.isReal ? "real" : "integer", number.digits);
}

bool XmlWriter::writeData(const Bytes& bytes)
{
    writeLine("<data>");
    for (std::size_t at = 0; at < bytes.size(); at += kBytesADataLine) {
        indent();
        appendBase64(_text,
                     ByteView(bytes).subspan(at, std::min(kBytesADataLine, bytes.size() - at)));
        _text += '\n';
    }
    return writeLine("</data>");
}

bool XmlWriter::writeDate(PropertyDate date)
{
    const auto first = static_cast<double>(secondsSince1970({1, 1, 1, 0, 0, 0}));
    const auto beyond = static_cast<double>(secondsSince1970({10000, 1, 1, 0, 0, 0}));
    // Also false for a not-a-number.
    if (!(date.secondsSince1970 >= first && date.secondsSince1970 < beyond))
        return false;
    const CalendarTime time =
        calendarTime(static_cast<std::int64_t>(std::floor(date.secondsSince1970)));
    char text[64];
    std::snprintf(text, sizeof text, "<date>%04d-%02d-%02dT%02d:%02d:%02dZ</date>",
                  static_cast<int>(time.year), time.month, time.day, time.hour, time.minute,
                  time.second);
    return writeLine(text);
}

bool XmlWriter::writeLine(std::string_view line)
{
    indent();
    (_text += line) += '\n';
    return true;
}

} // namespace

std::optional<std::string> writeXmlPropertyList(const PropertyValue& value)
{
    XmlWriter writer;
    if (!writer.writeList(value))
        return std::nullopt;
    return writer.takeText();
}

std::optional<Bytes> xmlPropertyListBytes(const PropertyValue& value)
{
    const std::optional<std::string> text = writeXmlPropertyList(value);
    return text ? std::optional(Bytes(text->begin(), text->end())) : std::nullopt;
}

} // namespace orvane
