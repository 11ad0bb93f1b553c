#pragma once

#include "platform/linux/UnixSocket.h"

#include <gtest/gtest.h>

#include <string>
#include <sys/socket.h>

namespace orvane
{

// Leaves a socket file at the path, as a killed program does.
inline void leaveStaleSocket(const std::string& path)
{
    std::string error;
    const auto address = socketAddress(path, error);
    ASSERT_TRUE(address) << error;
    const FileDescriptor socket = newStreamSocket();
    ASSERT_EQ(::bind(socket.get(), reinterpret_cast<const sockaddr*>(&*address), sizeof *address),
              0)
        << path;
    ASSERT_EQ(::listen(socket.get(), 1), 0);
}

} // namespace orvane
