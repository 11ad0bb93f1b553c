#pragma once

#include <stdexcept>
#include <string>

namespace orvane
{

// A failed internal-consistency check: what was found, and which source and line ask for it.
class InternalInconsistency : public std::logic_error
{
public:
    InternalInconsistency(const std::string& description, const std::string& source, int line)
        : std::logic_error(description + " (" + source + ":" + std::to_string(line) + ")"),
          _description(description), _source(source), _line(line)
    {
    }

    [[nodiscard]] const std::string& description() const { return _description; }
    [[nodiscard]] const std::string& source() const { return _source; }
    [[nodiscard]] int line() const { return _line; }

private:
    std::string _description;
    std::string _source;
    int _line;
};

} // namespace orvane
