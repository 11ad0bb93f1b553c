#include "screens/print/JsonPrinter.h"

#include "platform/base/Calendar.h"
#include "platform/base/JsonText.h"
#include "platform/services/Services.h"

#include <cmath>
#include <utility>

namespace orvane
{

namespace
{

void appendNumber(std::string& to, std::string_view number, std::string_view unit)
{
    to += ",\"number\":";
    // JSON has no leading zeros.
    if (number.starts_with('-')) {
        to += '-';
        number.remove_prefix(1);
    }
    while (number.size() > 1 && number[0] == '0' && number[1] != '.')
        number.remove_prefix(1);
    to += number;
    if (unit.empty())
        return;
    to += ",\"unit\":";
    appendJsonString(to, unit);
}

void appendTime(std::string& to, std::int64_t milliseconds)
{
    if (milliseconds == kNoReadingTime)
        return;
    to += ",\"time\":";
    appendJsonString(to, isoTimeText(milliseconds));
}

void appendReading(std::string& to, const PropertyValue& value)
{
    if (const TextReading* text = value.asTextReading()) {
        appendNumber(to, text->number, text->unit);
        appendTime(to, text->time);
    } else if (const Reading* reading = value.asReading()) {
        if (const auto number = reading->numberText())
            appendNumber(to, *number, reading->description->format->unit());
        appendTime(to, reading->time);
    }
}

} // namespace

void appendJsonNode(std::string& to, const OrvaneModelNode* node, bool hasDetails)
{
    if (!node) {
        to += "null";
        return;
    }
    to += "{\"name\":";
    appendJsonString(to, node->displayName());
    if (const std::string* value = node->value()) {
        to += ",\"value\":";
        appendJsonString(to, *value);
        if (hasDetails)
            appendReading(to, node->reading());
    } else if (const auto* children = node->childNodes()) {
        to += ",\"children\":[";
        const char* separator = "";
        for (const NodePointer& child : *children) {
            to += separator;
            appendJsonNode(to, child.get(), hasDetails);
            separator = ",";
        }
        to += ']';
    }
    to += '}';
}

std::string JsonPrinter::line(std::string members) const
{
    return "{" + std::move(members) + (_isSimulated ? ",\"simulated\":true}\n" : "}\n");
}

std::string JsonPrinter::statusOutput(const std::string& status, bool isLoading,
                                      const OrvaneModelNode* tree) const
{
    std::string members = "\"status\":";
    appendJsonString(members, status);
    members += isLoading ? ",\"loading\":true" : ",\"loading\":false";
    members += ",\"tree\":";
    appendJsonNode(members, tree, _details != JsonDetails::None);
    if (time()) {
        members += ",\"time\":";
        appendJsonString(members, *time());
    } else if (_details == JsonDetails::OfLiveView) {
        const double now = Services::current().clock().secondsSince1970();
        appendTime(members, static_cast<std::int64_t>(std::floor(now * 1000)));
    }
    return line(std::move(members));
}

std::string JsonPrinter::savedOutput(const std::string& path) const
{
    std::string members = "\"saved\":";
    appendJsonString(members, path);
    return line(std::move(members));
}

std::string JsonPrinter::alertOutput(const std::string& title, const std::string& message) const
{
    std::string members = "\"alert\":";
    appendJsonString(members, title);
    members += ",\"message\":";
    appendJsonString(members, message);
    return line(std::move(members));
}

std::string JsonPrinter::errorOutput(const std::string& text) const
{
    std::string members = "\"error\":";
    appendJsonString(members, text);
    return line(std::move(members));
}

} // namespace orvane
