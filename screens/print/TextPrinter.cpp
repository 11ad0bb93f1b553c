#include "screens/print/TextPrinter.h"

#include "platform/base/Utf8.h"

namespace orvane
{

namespace
{

void appendOutline(std::string& to, const OrvaneModelNode& node, std::size_t level)
{
    to.append(2 * level, ' ');
    to += printableText(node.displayName());
    if (const std::string* value = node.value())
        to += ": " + printableText(*value);
    to += '\n';
    if (const auto* children = node.childNodes())
        for (const NodePointer& child : *children)
            appendOutline(to, *child, level + 1);
}

// Blocks are parted by a blank line, so each ends with one.
std::string block(std::string lines) { return lines + "\n"; }

} // namespace

std::string TextPrinter::statusOutput(const std::string& status, bool,
                                      const OrvaneModelNode* tree) const
{
    std::string lines = printableText(status) + (_isSimulated ? " (simulated phone)\n" : "\n");
    if (tree)
        appendOutline(lines, *tree, 0);
    return block(std::move(lines));
}

std::string TextPrinter::savedOutput(const std::string& path) const
{
    return block("Saved to " + printableText(path) + "\n");
}

std::string TextPrinter::alertOutput(const std::string& title, const std::string& message) const
{
    return block(printableText(title) + ": " + printableText(message) + "\n");
}

std::string TextPrinter::errorOutput(const std::string& text) const
{
    return block("Error: " + printableText(text) + "\n");
}

std::string TextPrinter::noteOutput(const std::string& text) const
{
    return block(printableText(text) + "\n");
}

} // namespace orvane
