#pragma once

#include "screens/print/Printer.h"

namespace orvane
{

// Prints one JSON object a line, members in a fixed order, without spaces between them.
class JsonPrinter final : public Printer
{
public:
    // Each object of a simulated phone ends with "simulated":true.
    JsonPrinter(Write write, bool isSimulated)
        : Printer(std::move(write)), _isSimulated(isSimulated)
    {
    }

protected:
    [[nodiscard]] std::string statusOutput(const std::string& status, bool isLoading,
                                           const OrvaneModelNode* tree) const override;
    [[nodiscard]] std::string savedOutput(const std::string& path) const override;
    [[nodiscard]] std::string alertOutput(const std::string& title,
                                          const std::string& message) const override;
    [[nodiscard]] std::string errorOutput(const std::string& text) const override;

private:
    [[nodiscard]] std::string line(std::string members) const;

    bool _isSimulated;
};

// Appends {"name":...,"children":[...]} or {"name":...,"value":...}; null for no node.
void appendJsonNode(std::string& to, const OrvaneModelNode* node);

} // namespace orvane
