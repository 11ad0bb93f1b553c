#pragma once

#include "LogGenerator/LogChannelObserver.h"
#include "LogGenerator/LogGenerator.h"
#include "platform/base/Bytes.h"
#include "platform/base/PropertyValue.h"
#include "platform/ports/MessagePorts.h"
#include "platform/ports/TelephonyServer.h"
#include "platform/services/MainQueue.h"
#include "ui/tree/OrvaneModelNode.h"

#include <chrono>
#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <typeindex>

namespace orvane
{

// What the model asks of the shell. Both are called on the main queue, never from within a message.
class ModelObserver
{
public:
    virtual ~ModelObserver() = default;
    // New data has arrived since the last call: read the tree again.
    virtual void updateViewControllerFromModel() = 0;
    // A start or restart has ended; whether the model is connected may have changed.
    virtual void monitorStartEnded() = 0;
    // What isModemMissing() says has changed.
    virtual void modemPresenceChanged() = 0;
};

// What a model uses. Nothing is owned; all must outlive the model.
struct ModelEnvironment {
    MainQueue& queue;
    MessagePorts& ports;
    TelephonyServer& server;
    std::chrono::nanoseconds refreshInterval = std::chrono::seconds(2);
    // Makes the unique part of the local port's name.
    std::function<std::optional<std::string>()> makeUuid;
    // Sees every channel and every message, before it is decoded. May be null.
    LogChannelObserver* channelObserver = nullptr;
};

// The one model: owns the log-channel connection, the generator and the state that the generator
// fills, and gives the display as a tree. Main thread only.
//
// The connection (OrvaneModelConnection.cpp) is Stopped, Connecting (within startMonitor), Waiting
// (for a retry 5 s after any failure, without limit) or Running.
class OrvaneModel : public std::enable_shared_from_this<OrvaneModel>
{
public:
    // The observer may be null; it must outlive the model.
    OrvaneModel(ModelEnvironment environment, ModelObserver* observer);
    ~OrvaneModel();
    OrvaneModel(const OrvaneModel&) = delete;
    OrvaneModel& operator=(const OrvaneModel&) = delete;

    // The root of the display tree, made if there is none yet. Null without a generator.
    NodePointer topLevelNodes();
    // The node at that path, or null.
    NodePointer nodeAtPath(const std::string& path);

    // Hands one message to the generator.
    void updateWithData(ByteView data);
    // The timer's action: checks the connection and, if data came since the last time, drops the
    // tree and has the view updated.
    void refresh();
    // The same, with an argument that is ignored.
    void refresh(const void*) { refresh(); }
    // The generator's save contents. Without a generator, the entries that the history still holds.
    PropertyValue getSaveContents();

    // Returns whether both ports exist. What it made stays until destroyPorts().
    bool createPorts();
    void destroyPorts();
    [[nodiscard]] bool isConnected() const { return _recvPort && _sendPort; }
    // Whether the server has said that its modem is missing.
    [[nodiscard]] bool isModemMissing() const { return _isModemMissing; }
    void configureGenerator();
    // Does nothing while running.
    void startMonitor();
    void restartMonitor();

private:
    // The platform's callbacks; the context is the model, or null.
    static std::optional<Bytes> messageReceived(std::int32_t messageId, ByteView data,
                                                OrvaneModel* context);
    static void portInvalidated(const MessagePort& port, OrvaneModel* context);
    static void serverNotification(OrvaneModel* context, const std::string& name);

    bool openSession();
    void setModemMissing(bool isMissing);
    void keepTreeForQueuedUpdate();
    void adoptGenerator(std::unique_ptr<LogGenerator> generator);
    void checkHealth();
    void scheduleRetry();

    ModelEnvironment _environment;
    ModelObserver* _observer;
    std::shared_ptr<PropertyDictionary> _state;
    std::unique_ptr<LogGenerator> _logGenerator;
    // The class of the generator that made the state's history.
    std::optional<std::type_index> _historyClass;
    bool _updated = false;
    bool _isModemMissing = false;
    bool _isViewUpdateQueued = false;
    NodePointer _nodes;
    std::optional<PathDictionary> _nodesByPath;
    std::unique_ptr<LocalMessagePort> _recvPort;
    std::unique_ptr<RemoteMessagePort> _sendPort;
    std::unique_ptr<Timer> _displayUpdateTimer;
};

} // namespace orvane
