#pragma once

#include "platform/linux/FileDescriptor.h"

#include <optional>
#include <string>
#include <sys/socket.h>
#include <sys/un.h>

namespace orvane
{

// The system's words for an errno value.
std::string errorText(int error);

// Returns nullopt, with the reason in `error`, when the path is longer than an address holds.
std::optional<sockaddr_un> socketAddress(const std::string& path, std::string& error);

// Makes a stream socket that never blocks, is not inherited, and has large buffers. Returns none on
// failure, with errno set.
FileDescriptor newStreamSocket();
void enlargeBuffers(int socket);

// Returns 0 or errno. EAGAIN means that a process listens whose queue of callers is full.
int connectTo(int socket, const sockaddr_un& address);

} // namespace orvane
