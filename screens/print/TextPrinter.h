#pragma once

#include "screens/print/Printer.h"

namespace orvane
{

// Prints blocks parted by a blank line: the status, then the tree as an outline, two spaces a
// level, "NAME: VALUE" or "NAME".
class TextPrinter final : public Printer
{
public:
    // On a simulated phone the status line ends with " (simulated phone)".
    TextPrinter(Write write, bool isSimulated)
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
    [[nodiscard]] std::string noteOutput(const std::string& text) const override;

private:
    bool _isSimulated;
};

} // namespace orvane
