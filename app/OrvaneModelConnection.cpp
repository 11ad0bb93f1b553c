#include "app/OrvaneModel.h"

#include "platform/base/Bytes.h"
#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"
#include "platform/plist/PropertyList.h"
#include "platform/services/SystemLog.h"

#include <chrono>
#include <exception>
#include <utility>

// The log-channel connection of OrvaneModel.

namespace orvane
{

namespace
{

using namespace std::chrono_literals;

constexpr auto kSendTimeout = 1000ms;
constexpr auto kReplyTimeout = 1000ms;
constexpr auto kRetryDelay = 5s;

SendStatus sendTo(RemoteMessagePort* port, ByteView data, Bytes* reply)
{
    if (!port)
        return SendStatus::NotValid;
    return port->send(kChannelMessage, data, kSendTimeout, reply ? kReplyTimeout : 0ms, reply);
}

} // namespace

bool OrvaneModel::createPorts()
{
    const std::optional<std::string> uuid =
        _environment.makeUuid ? _environment.makeUuid() : std::nullopt;
    if (!uuid)
        return false;
    const std::string name = "OrvaneApp." + *uuid;

    // Deliberate: not tested here. A missing local port is reported by the result, after the other
    // steps have logged how far they came.
    _recvPort = _environment.ports.createLocal(
        name, [this](LocalMessagePort&, std::int32_t messageId, ByteView data) {
            return messageReceived(messageId, data, this);
        });
    if (_recvPort) {
        _recvPort->setDispatchQueue(_environment.queue);
        _recvPort->setInvalidationCallback(
            [this](const MessagePort& port) { portInvalidated(port, this); });
    }

    LogChannelResult channel;
    {
        const auto connection = _environment.server.createConnection(
            [weak = weak_from_this()](const std::string& notification, const PropertyValue&) {
                serverNotification(weak.lock().get(), notification);
            });
        if (!connection) {
            logError("Could not create TSServerConnection");
            return false;
        }
        channel = connection->createNetworkMonitorLogChannel(name);
    }
    if (channel.error != 0) {
        logError("_TSServerConnectionNetworkMonitorCreateLogChannel returns error: %ld!",
                 static_cast<long>(channel.error));
        return false;
    }
    if (!channel.port || channel.port->empty()) {
        logError("Could not create a log channel (TS returned null port)!");
        return false;
    }
    _sendPort = _environment.ports.createRemote(*channel.port);
    if (!_sendPort) {
        logError("Could not create the remote port!");
        return false;
    }
    logError(" ***** Created ports (send=%p, recv=%p)", static_cast<void*>(_sendPort.get()),
             static_cast<void*>(_recvPort.get()));
    return isConnected();
}

void OrvaneModel::destroyPorts()
{
    if (_displayUpdateTimer) {
        _displayUpdateTimer->invalidate();
        _displayUpdateTimer.reset();
    }
    // The callback goes first, so that tearing down never triggers a restart.
    if (_recvPort) {
        _recvPort->setInvalidationCallback({});
        _recvPort->invalidate();
        _recvPort.reset();
    }
    if (_sendPort) {
        _sendPort->setInvalidationCallback({});
        _sendPort->invalidate();
        _sendPort.reset();
    }
}

void OrvaneModel::configureGenerator()
{
    const auto query = xmlPropertyListBytes(PropertyValue::dictionaryOf({
        {kGetTechnologyKey, kGetTechnologyKey}
    }));
    if (!query) {
        logError(" Could not generate GetTechnology command; cannot configure");
        return;
    }
    Bytes reply;
    const SendStatus status = sendTo(_sendPort.get(), *query, &reply);
    if (status != SendStatus::Success) {
        logError(" ***** Could not send the GetTechnology command (got error=%d)",
                 static_cast<int>(status));
        return;
    }
    if (reply.empty()) {
        logError(" ***** No response to GetTechnology; cannot configure");
        return;
    }
    const PropertyValue answer = readPropertyList(reply).value;
    if (!answer) {
        logError(" ***** Could not parse reply to GetTechnology; cannot configure");
        return;
    }
    const PropertyValue& technology = answer[kGetTechnologyKey];
    if (!technology) {
        logError(" ***** Reply to GetTechnology had no answer; cannot configure");
        return;
    }
    adoptGenerator(LogGenerator::generatorFromTechnology(technology));
    if (_logGenerator && _environment.channelObserver)
        _environment.channelObserver->channelOpened(technology);
    logError("Got log generated: %p", static_cast<void*>(_logGenerator.get()));
}

void OrvaneModel::startMonitor()
{
    if (_displayUpdateTimer)
        return;
    // The server says it again for the next channel.
    setModemMissing(false);
    bool isRunning = false;
    try {
        isRunning = openSession();
    } catch (const std::exception& failure) {
        logError("The monitor could not be started: %s", failure.what());
    }
    if (!isRunning)
        scheduleRetry();
    if (_observer)
        _observer->monitorStartEnded();
}

bool OrvaneModel::openSession()
{
    if (!createPorts()) {
        logError("Could not create the ports necessary");
        return false;
    }
    configureGenerator();
    if (!_logGenerator) {
        logError("No log generator technology works");
        return false;
    }
    const auto command = xmlPropertyListBytes(_logGenerator->getStartCommand());
    if (!command) {
        logError(" Could not generate PLIST");
        return false;
    }
    const SendStatus status = sendTo(_sendPort.get(), *command, nullptr);
    if (status != SendStatus::Success) {
        logError(" ***** Could not send the START command (got error=%d)",
                 static_cast<int>(status));
        return false;
    }
    logError("Starting the display update timer");
    _displayUpdateTimer =
        _environment.queue.repeatingTimer(_environment.refreshInterval, [this] { refresh(); });
    return true;
}

void OrvaneModel::restartMonitor()
{
    destroyPorts();
    startMonitor();
}

void OrvaneModel::scheduleRetry()
{
    destroyPorts();
    // Weak, so that a retry still pending ends with the model.
    _environment.queue.after(kRetryDelay, [weak = weak_from_this()] {
        if (const auto model = weak.lock())
            model->startMonitor();
    });
}

void OrvaneModel::checkHealth()
{
    if (isConnected() && !_sendPort->isValid())
        _recvPort->invalidate();
}

std::optional<Bytes> OrvaneModel::messageReceived(std::int32_t messageId, ByteView data,
                                                  OrvaneModel* context)
{
    if (messageId != kChannelMessage || !context)
        return std::nullopt;
    // An exception ends this message only. The next one is decoded.
    try {
        context->updateWithData(data);
    } catch (const std::exception& failure) {
        logError("Dropping a message of %zu bytes: %s", data.size(), failure.what());
    }
    return std::nullopt;
}

void OrvaneModel::portInvalidated(const MessagePort& port, OrvaneModel* context)
{
    logError(" ***** INVALIDATED %p *****", static_cast<const void*>(&port));
    if (context)
        context->restartMonitor();
}

void OrvaneModel::serverNotification(OrvaneModel* context, const std::string& name)
{
    if (!context)
        return;
    if (name == kModemMissingNotification)
        context->setModemMissing(true);
    else if (name == kModemPresentNotification)
        context->setModemMissing(false);
    context->refresh();
}

void OrvaneModel::setModemMissing(bool isMissing)
{
    if (std::exchange(_isModemMissing, isMissing) != isMissing && _observer)
        _observer->modemPresenceChanged();
}

} // namespace orvane
