// A telephony server that misbehaves as its mode says: scripted_server DIRECTORY MODE. Prints a
// line for each start command, then sends one message with id 0. In the mode "other-ids" messages
// with other ids come before it.

#include "doubles/ScriptedTelephonyServer.h"
#include "platform/base/TelephonyConstants.h"
#include "platform/linux/QtEventLoop.h"
#include "platform/linux/QtMainQueue.h"
#include "platform/linux/SocketTransport.h"

#include <cstdio>
#include <cstdlib>
#include <string_view>

using namespace orvane;

namespace
{

using ChannelAnswer = ScriptedTelephonyServer::ChannelAnswer;
using TechnologyAnswer = ScriptedTelephonyServer::TechnologyAnswer;

// A serving-cell packet of 38 bytes whose physical cell id is `cell`.
Bytes message(std::uint8_t cell)
{
    Bytes bytes(38, 0);
    bytes[0] = 1;
    bytes[1] = 37;
    bytes[3] = 0xC2;
    bytes[4] = 0xB0;
    bytes[14] = cell;
    return bytes;
}

bool arrange(ScriptedTelephonyServer& server, std::string_view mode)
{
    if (mode == "no-channel-reply")
        server.channelAnswer = ChannelAnswer::None;
    else if (mode == "garbage-channel-reply")
        server.channelAnswer = ChannelAnswer::Garbage;
    else if (mode == "empty-port")
        server.channelAnswer = ChannelAnswer::EmptyPort;
    else if (mode == "error-code")
        server.channelError = 42;
    else if (mode == "no-reply")
        server.technologyAnswer = TechnologyAnswer::None;
    else if (mode == "empty-reply")
        server.technologyAnswer = TechnologyAnswer::Empty;
    else if (mode == "garbage-reply")
        server.technologyAnswer = TechnologyAnswer::Garbage;
    else if (mode == "no-key")
        server.technologyAnswer = TechnologyAnswer::NoKey;
    else if (mode == "unknown-technology")
        server.technology = "kTSLogChannelTechnology_Unheard";
    else if (mode == "dies-before-start")
        server.afterTechnologyAnswer = [&server] { server.closeChannels(); };
    else
        return mode == "streaming" || mode == "other-ids";
    return true;
}

} // namespace

int main(int argc, char** argv)
{
    if (argc != 3)
        return 2;
    const std::string_view mode = argv[2];
    QtEventLoop loop;
    QtMainQueue queue;
    SocketTransport transport(PortsDirectory::unchecked(argv[1]));
    ScriptedTelephonyServer server(transport, queue);
    if (!arrange(server, mode))
        return 2;
    std::puts("ready");
    std::fflush(stdout);
    std::size_t started = 0;
    const auto poll = queue.repeatingTimer(std::chrono::milliseconds(10), [&] {
        if (server.startCommands().size() == started)
            return;
        started = server.startCommands().size();
        std::puts("started");
        std::fflush(stdout);
        if (mode == "other-ids") {
            server.sendLogMessage(message(1), 1);
            server.sendLogMessage(message(2), -1);
        }
        server.sendLogMessage(message(3));
    });
    return loop.run();
}
