#pragma once

#include "LogGenerator/Section.h"

#include <exception>

namespace orvane
{

// The telephony server's record of SIM files.
struct LogCode_0xFF0000 {
    // The record is no property list. It ends the decoding of that message.
    class UnknownDataException : public std::exception
    {
    public:
        [[nodiscard]] const char* what() const noexcept override
        {
            return "the SIM file dictionary is not a property list";
        }
    };
};

// "SIM Info": elementary files of the SIM as the telephony server reports them, each value as it
// came. A file that is no longer reported keeps its row. Throws
// LogCode_0xFF0000::UnknownDataException for a record that cannot be parsed.
class SimInfo final : public Section
{
public:
    SimInfo();

private:
    void decode(PacketView packet, const PacketLayout& layout) override;
};

} // namespace orvane
