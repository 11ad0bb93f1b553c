#pragma once

#include "platform/linux/PortsDirectory.h"

#include <string>

namespace orvane
{

// Whether the process at the other end of a connected socket may talk to this one over a port of
// the directory, by its effective user and its groups. An error line says who was refused.
bool isPeerTrusted(int socket, const PortsDirectory& directory);

// The same for the end that connected, to the port of that name: the telephony server of a shared
// directory is its owner and nobody else.
bool isListenerTrusted(int socket, const PortsDirectory& directory, const std::string& port);

} // namespace orvane
