#pragma once

#include "screens/print/Printer.h"

namespace orvane
{

// What is printed beside names and values.
enum class JsonDetails {
    None,
    OfRecording, // of readings the number, the unit and the time
    OfLiveView,  // the same, and with each status the time of printing it
};

// Prints one JSON object a line, members in a fixed order, without spaces between them.
class JsonPrinter final : public Printer
{
public:
    // Each object of a simulated phone ends with "simulated":true.
    JsonPrinter(Write write, bool isSimulated, JsonDetails details = JsonDetails::None)
        : Printer(std::move(write)), _isSimulated(isSimulated), _details(details)
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
    JsonDetails _details;
};

// Appends {"name":...,"children":[...]} or {"name":...,"value":...}; null for no node. With details
// a node that shows a reading has also "number", "unit" and "time", as far as it has them.
void appendJsonNode(std::string& to, const OrvaneModelNode* node, bool hasDetails = false);

} // namespace orvane
