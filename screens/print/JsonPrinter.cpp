#include "screens/print/JsonPrinter.h"

#include "platform/base/JsonText.h"

#include <utility>

namespace orvane
{

void appendJsonNode(std::string& to, const OrvaneModelNode* node)
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
    } else if (const auto* children = node->childNodes()) {
        to += ",\"children\":[";
        const char* separator = "";
        for (const NodePointer& child : *children) {
            to += separator;
            appendJsonNode(to, child.get());
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
    appendJsonNode(members, tree);
    if (time()) {
        members += ",\"time\":";
        appendJsonString(members, *time());
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
