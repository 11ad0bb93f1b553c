#pragma once

#include "platform/base/Bytes.h"
#include "platform/base/PropertyValue.h"
#include "platform/ports/FrameConnection.h"
#include "telephonyd/HalfFrameWatch.h"
#include "telephonyd/phone/LogSource.h"

#include <functional>
#include <memory>
#include <string>

namespace orvane
{

// One log channel of the server: the port that takes a client's commands, the connection on which
// its log messages go out, and the source that they come from.
//
// The first connection to the port is the client's. Further ones are closed. The channel ends when
// that connection or the one to the client closes, or when the client leaves too much unread. Then
// both are closed, the port's name is free, and the owner destroys the channel soon after.
class LogChannel
{
public:
    // More than this unsent: the source is asked to wait, then the channel is given up.
    static constexpr std::size_t kBehindBytes = 1024U * 1024;
    static constexpr std::size_t kUnreadLimit = 64U * 1024 * 1024;

    struct Events {
        std::function<void()> firstMessage; // the first message has been queued
        std::function<void()> ended;        // must not destroy the channel from within
    };

    // `name` is the name of the port on which `listener` listens.
    LogChannel(std::string name, std::unique_ptr<FrameListener> listener,
               std::unique_ptr<FrameConnection> toClient, std::unique_ptr<LogSource> source,
               Events events);
    LogChannel(const LogChannel&) = delete;
    LogChannel& operator=(const LogChannel&) = delete;

    [[nodiscard]] const std::string& name() const { return _name; }

    // To be called once a kClientCheckInterval: ends the channel whose client has not started it,
    // or has left a frame unfinished, for kClientTimeout.
    void checkClient();

private:
    void accept(std::unique_ptr<FrameConnection> connection);
    void take(const FrameReader::View& frame);
    // The reply to the command, if it has one.
    std::optional<Bytes> obey(const FrameReader::View& frame);
    void start(const PropertyValue& command);
    bool send(ByteView message);
    void drained();
    void end();

    std::string _name;
    std::unique_ptr<FrameListener> _listener;
    std::unique_ptr<FrameConnection> _fromClient;
    std::unique_ptr<FrameConnection> _toClient;
    Events _events;
    HalfFrameWatch _fromClientWatch;
    HalfFrameWatch _toClientWatch;
    int _checksBeforeStart = 0;
    bool _hasStarted = false;
    bool _hasSent = false;
    bool _isBehind = false;
    bool _hasEnded = false;
    std::unique_ptr<LogSource> _source; // goes first, since it calls send()
};

} // namespace orvane
