#pragma once

#include "platform/services/ByteDevice.h"

#include <memory>
#include <string>

namespace orvane
{

// Opens a serial device (set to 115200 baud, 8N1, raw, no flow control) or another character device
// for this program alone, on the event loop of the calling thread. Null, with one line in `error`
// that names the device, the cause and the remedy, where it is absent, in use, not permitted or no
// such device.
std::unique_ptr<ByteDevice> openSerialDevice(const std::string& path, std::string& error);

} // namespace orvane
