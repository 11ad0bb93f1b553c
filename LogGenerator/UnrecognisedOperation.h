#pragma once

#include <stdexcept>
#include <string>

namespace orvane
{

// Thrown by an abstract operation that a subclass did not supply.
class UnrecognisedOperation : public std::logic_error
{
public:
    explicit UnrecognisedOperation(const std::string& operation)
        : std::logic_error("unrecognised operation " + operation)
    {
    }
};

} // namespace orvane
