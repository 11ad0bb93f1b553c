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

// Nothing, with the reason in `error`, when the path is longer than an address holds.
std::optional<sockaddr_un> socketAddress(const std::string& path, std::string& error);

// A stream socket that never blocks, is not inherited, and has large buffers. None on failure, with
// errno set.
FileDescriptor newStreamSocket();
void enlargeBuffers(int socket);

// 0 or the errno value with which the connect failed; EAGAIN means a live but overrun listener.
int connectTo(int socket, const sockaddr_un& address);

// Whether the process at the other end runs as this effective user or as root; says so in the log
// if not.
bool isPeerTrusted(int socket);

} // namespace orvane
