#include "platform/plist/PropertyListXmlScalars.h"

#include "platform/base/Calendar.h"
#include "platform/plist/PropertyListText.h"

#include <array>
#include <charconv>

namespace orvane
{

namespace
{

std::string_view trimmed(std::string_view text)
{
    while (!text.empty() && isXmlSpace(text.front()))
        text.remove_prefix(1);
    while (!text.empty() && isXmlSpace(text.back()))
        text.remove_suffix(1);
    return text;
}

PropertyValue refused(std::string_view text, const char* what, std::string& error)
{
    error = quotedExcerpt(text) + " is not " + what;
    return {};
}

bool isLeapYear(int year) { return year % 4 == 0 && (year % 100 != 0 || year % 400 == 0); }

int daysOfMonth(int year, int month)
{
    constexpr int kDays[] = {31, 28, 31, 30, 31, 30, 31, 31, 30, 31, 30, 31};
    return month == 2 && isLeapYear(year) ? 29 : kDays[month - 1];
}

// The number written in the `width` digits at `at`.
int digits(std::string_view text, std::size_t at, std::size_t width)
{
    int number = 0;
    for (const char digit : text.substr(at, width))
        number = number * 10 + (digit - '0');
    return number;
}

constexpr std::uint8_t kNoSextet = 0xFF;

constexpr std::array<std::uint8_t, 256> sextets()
{
    std::array<std::uint8_t, 256> table{};
    for (std::uint8_t& sextet : table)
        sextet = kNoSextet;
    constexpr std::string_view kAlphabet =
        "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789+/";
    for (std::size_t i = 0; i < kAlphabet.size(); ++i)
        table[static_cast<unsigned char>(kAlphabet[i])] = static_cast<std::uint8_t>(i);
    return table;
}

constexpr std::array<std::uint8_t, 256> kSextets = sextets();

} // namespace

PropertyValue integerFromXml(std::string_view text, std::string& error)
{
    std::string_view rest = trimmed(text);
    const bool isNegative = rest.starts_with('-');
    if (isNegative || rest.starts_with('+'))
        rest.remove_prefix(1);
    const bool isHexadecimal = rest.starts_with("0x") || rest.starts_with("0X");
    if (isHexadecimal)
        rest.remove_prefix(2);

    std::uint64_t magnitude = 0;
    const char* const end = rest.data() + rest.size();
    const auto [stopped, fault] =
        std::from_chars(rest.data(), end, magnitude, isHexadecimal ? 16 : 10);
    if (stopped != end || fault == std::errc::invalid_argument)
        return refused(text, "an integer", error);
    const std::uint64_t highest = INT64_MAX;
    if (fault != std::errc() || magnitude > (isNegative ? highest + 1 : highest))
        return PropertyValue::largeNumber({std::string(trimmed(text)), false});
    return PropertyValue::integer(
        static_cast<std::int64_t>(isNegative ? 0 - magnitude : magnitude));
}

PropertyValue realFromXml(std::string_view text, std::string& error)
{
    std::string_view rest = trimmed(text);
    if (rest.starts_with('+') && !rest.starts_with("+-"))
        rest.remove_prefix(1);
    double number = 0;
    const char* const end = rest.data() + rest.size();
    const auto [stopped, fault] = std::from_chars(rest.data(), end, number);
    // from_chars would also accept a not-a-number with a payload in brackets.
    if (stopped != end || fault == std::errc::invalid_argument || rest.ends_with(')'))
        return refused(text, "a real number", error);
    if (fault != std::errc())
        return PropertyValue::largeNumber({std::string(trimmed(text)), true});
    return PropertyValue::real(number);
}

PropertyValue dateFromXml(std::string_view text, std::string& error)
{
    const std::string_view date = trimmed(text);
    constexpr std::string_view kForm = "0000-00-00T00:00:00Z";
    bool isDate = date.size() == kForm.size();
    for (std::size_t i = 0; isDate && i < kForm.size(); ++i)
        isDate = kForm[i] == '0' ? date[i] >= '0' && date[i] <= '9' : date[i] == kForm[i];
    if (!isDate)
        return refused(text, "a date of the form YYYY-MM-DDThh:mm:ssZ", error);

    const int year = digits(date, 0, 4);
    const int month = digits(date, 5, 2);
    const int day = digits(date, 8, 2);
    const CalendarTime time{
        year, month, day, digits(date, 11, 2), digits(date, 14, 2), digits(date, 17, 2)};
    if (year < 1 || month < 1 || month > 12 || day < 1 || day > daysOfMonth(year, month) ||
        time.hour > 23 || time.minute > 59 || time.second > 59)
        return refused(text, "a date of the calendar", error);
    return PropertyValue::date({static_cast<double>(secondsSince1970(time))});
}

PropertyValue dataFromXml(std::string_view text, std::string& error)
{
    Bytes bytes;
    bytes.reserve(text.size() / 4 * 3);
    std::uint32_t group = 0;
    int characters = 0; // of the group, padding included
    int padding = 0;
    for (const char character : text) {
        if (isXmlSpace(character))
            continue;
        std::uint8_t sextet = kSextets[static_cast<unsigned char>(character)];
        if (character == '=' && characters >= 2) {
            ++padding;
            sextet = 0;
        } else if (sextet == kNoSextet || padding != 0) {
            return refused(text, "base64 text", error);
        }
        group = group << 6 | sextet;
        if (++characters < 4)
            continue;
        bytes.push_back(static_cast<std::uint8_t>(group >> 16));
        if (padding < 2)
            bytes.push_back(static_cast<std::uint8_t>(group >> 8));
        if (padding < 1)
            bytes.push_back(static_cast<std::uint8_t>(group));
        group = 0;
        characters = 0;
    }
    if (characters != 0)
        return refused(text, "whole base64 text", error);
    return PropertyValue::data(std::move(bytes));
}

} // namespace orvane
