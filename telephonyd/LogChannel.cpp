#include "telephonyd/LogChannel.h"

#include "platform/base/Bytes.h"
#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"
#include "platform/plist/PropertyList.h"
#include "platform/ports/FrameRequester.h"
#include "platform/services/SystemLog.h"
#include "telephonyd/StartCommand.h"

#include <utility>

namespace orvane
{

LogChannel::LogChannel(std::string name, std::unique_ptr<FrameListener> listener,
                       std::unique_ptr<FrameConnection> toClient, std::unique_ptr<LogSource> source,
                       Events events)
    : _name(std::move(name)), _listener(std::move(listener)), _toClient(std::move(toClient)),
      _events(std::move(events)), _source(std::move(source))
{
    _listener->setConnectionCallback([this](auto connection) { accept(std::move(connection)); });
    // The client sends nothing here, but the connection must be read to see its end.
    _toClient->setFrameCallback([](const FrameReader::View&) {});
    _toClient->setClosedCallback([this] { end(); });
    _toClient->setDrainedCallback([this] { drained(); });
}

void LogChannel::accept(std::unique_ptr<FrameConnection> connection)
{
    if (_fromClient) {
        logError("%s already has its client; closing another connection to it", _name.c_str());
        return;
    }
    _fromClient = std::move(connection);
    _fromClient->setFrameCallback([this](const FrameReader::View& frame) { take(frame); });
    _fromClient->setClosedCallback([this] { end(); });
}

void LogChannel::take(const FrameReader::View& frame)
{
    if (frame.isReply || _hasEnded)
        return;
    const std::optional<Bytes> reply =
        frame.messageId == kChannelMessage ? obey(frame) : std::nullopt;
    if (frame.wantsReply && !answerRequest(*_fromClient, frame.messageId, frame.serial, reply))
        end();
}

std::optional<Bytes> LogChannel::obey(const FrameReader::View& frame)
{
    const PropertyListResult command = readPropertyList(frame.data);
    if (!command.value) {
        logError("%s: a command is not a property list: %s", _name.c_str(), command.error.c_str());
        return std::nullopt;
    }
    if (command.value[kGetTechnologyKey]) {
        const std::string technology = _source->technology();
        if (technology.empty())
            return std::nullopt;
        return xmlPropertyListBytes(PropertyValue::dictionaryOf({
            {kGetTechnologyKey, technology}
        }));
    }
    const std::string* state = command.value[kSetStateKey].asString();
    if (state && *state == kStreaming)
        start(command.value);
    else
        logError("%s: ignoring an unknown command", _name.c_str());
    return std::nullopt;
}

void LogChannel::start(const PropertyValue& command)
{
    // A recording would otherwise start over in the middle of what the client has shown.
    if (std::exchange(_hasStarted, true)) {
        logWarning("%s: ignoring a second start command", _name.c_str());
        return;
    }
    _source->start(selectionOfStartCommand(command),
                   [this](ByteView message) { return send(message); });
}

bool LogChannel::send(ByteView message)
{
    if (_hasEnded)
        return false;
    if (message.size() > kFrameDataLimit) {
        logError("%s: leaving out a log message of %zu bytes", _name.c_str(), message.size());
        return true;
    }
    if (_toClient->queuedBytes() + kFrameHeaderBytes + message.size() > kUnreadLimit) {
        logError("%s: its client leaves more than %zu bytes of log messages unread; closing the "
                 "channel",
                 _name.c_str(), kUnreadLimit);
        end();
        return false;
    }
    if (!_toClient->send(kChannelMessage, 0, false, false, message)) {
        end();
        return false;
    }
    if (!std::exchange(_hasSent, true))
        _events.firstMessage();
    _isBehind = _toClient->queuedBytes() > kBehindBytes;
    return !_isBehind;
}

// Half of the limit for being behind, so that a source does not pause and resume with every
// message.
void LogChannel::drained()
{
    if (_hasEnded || !_isBehind || _toClient->queuedBytes() > kBehindBytes / 2)
        return;
    _isBehind = false;
    _source->resume();
}

void LogChannel::checkClient()
{
    if (_hasEnded)
        return;
    if (!_hasStarted && ++_checksBeforeStart > kClientChecks) {
        logWarning("%s: its client does not start it; closing the channel", _name.c_str());
        end();
    } else if ((_fromClient && _fromClientWatch.check(*_fromClient)) ||
               _toClientWatch.check(*_toClient)) {
        logWarning("%s: its client does not finish a frame; closing the channel", _name.c_str());
        end();
    }
}

void LogChannel::end()
{
    if (std::exchange(_hasEnded, true))
        return;
    _listener.reset();
    _toClient->close();
    if (_fromClient)
        _fromClient->close();
    _events.ended();
}

} // namespace orvane
