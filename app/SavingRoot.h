#pragma once

#include <string>

namespace orvane
{

// The root of the log folder and the install marker where the user gives no --root. Folders are
// made for the user alone and kept from one run to the next, with the marker and the log folder in
// them, so that saving is offered and works.

// The root of the live view: `machine` (the root of the file system) if the install marker is below
// it, else "orvane/root" in the user's state directory. Falls back to `machine`, with a warning,
// where that cannot be made.
std::string liveRoot(const std::string& machine = "/");

// The root of a simulated phone: "orvane/demo" in the user's state directory. Throws
// std::runtime_error with a line for the user where it cannot be made.
std::string simulatedPhoneRoot();

} // namespace orvane
