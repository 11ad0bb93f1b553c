#pragma once

#include "platform/linux/EventThread.h"
#include "platform/linux/PortsDirectory.h"

#include <string>

namespace orvane
{

// The simulated phone's telephony server, on a thread of its own. It shares only the ports with the
// viewer, and ends with the object.
class SimulatedPhone
{
public:
    // Throws std::runtime_error with a line for the user where the server cannot start.
    SimulatedPhone(const PortsDirectory& directory, const std::string& scenario);

private:
    EventThread _thread;
};

} // namespace orvane
