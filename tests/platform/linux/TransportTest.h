#pragma once

#include "platform/linux/FileDescriptor.h"
#include "platform/linux/PrivatePortsDirectory.h"
#include "platform/linux/QtTest.h"
#include "platform/linux/SocketTransport.h"
#include "platform/linux/UnixSocket.h"
#include "support/Recording.h"

#include <string>
#include <utility>
#include <vector>

namespace orvane
{

// A frame with its data copied out of the reader.
struct ReceivedFrame {
    std::int32_t messageId;
    std::uint32_t serial;
    bool wantsReply;
    bool isReply;
    Bytes data;
    friend bool operator==(const ReceivedFrame&, const ReceivedFrame&) = default;
};

// Real sockets in a directory of the test's own.
class TransportTest : public QtTest
{
protected:
    TransportTest() { Services::current().setLog(&log); }
    ~TransportTest() override { Services::current().setLog(nullptr); }

    [[nodiscard]] std::string pathOf(const std::string& name) const
    {
        return directory.path() + '/' + name;
    }

    // A plain socket connected to the port, for peers that do not keep to the rules.
    FileDescriptor connectPlainly(const std::string& name)
    {
        FileDescriptor socket = newStreamSocket();
        EXPECT_EQ(connectTo(socket.get(), *socketAddress(pathOf(name), error)), 0);
        return socket;
    }

    std::unique_ptr<FrameListener> listen(const std::string& name)
    {
        error.clear();
        auto listener = transport.listen(name, error);
        EXPECT_EQ(listener != nullptr, error.empty());
        return listener;
    }

    // The reason why nobody can listen there.
    std::string refusal(const std::string& name)
    {
        EXPECT_FALSE(listen(name)) << name;
        return error;
    }

    RecordingLog log;
    PrivatePortsDirectory directory;
    SocketTransport transport{directory.directory()};
    std::string error;
};

} // namespace orvane
