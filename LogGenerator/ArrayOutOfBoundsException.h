#pragma once

#include <exception>

namespace orvane
{

// Thrown by record readers for an index at or past the count that the packet carries. It ends the
// decoding of that message.
class ArrayOutOfBoundsException : public std::exception
{
public:
    [[nodiscard]] const char* what() const noexcept override
    {
        return "a record index is not below the packet's record count";
    }
};

} // namespace orvane
