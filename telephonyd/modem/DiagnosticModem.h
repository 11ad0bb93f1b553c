#pragma once

#include "platform/base/Bytes.h"
#include "platform/services/ByteDevice.h"
#include "platform/services/Lifetime.h"
#include "platform/services/MainQueue.h"
#include "telephonyd/modem/DiagnosticPort.h"
#include "telephonyd/modem/ModemTechnology.h"

#include <chrono>
#include <functional>
#include <memory>
#include <optional>
#include <set>
#include <string>
#include <vector>

namespace orvane
{

// A real modem behind its diagnostic port, for any number of listeners: keeps exactly the log codes
// switched on that they asked for (and those of a probe for the technology), and gives each the
// items of its codes. A modem that goes away is looked for every kLookAgain; listeners live on.
class DiagnosticModem
{
public:
    static constexpr std::chrono::seconds kLookAgain{2};

    struct Settings {
        std::string device;                    // its name, for log lines
        std::optional<std::string> technology; // the constant, if it is known
    };
    struct Events {
        // The modem serves another technology than listeners know. Must not destroy the modem.
        std::function<void()> technologyChanged;
        // What presence() says has changed. Must not destroy the modem.
        std::function<void()> presenceChanged;
    };
    enum class Presence {
        Unknown, // it has not answered yet
        Present, // it answers
        Missing, // it has gone, or does not answer
    };
    // A log message as it goes to a client, valid during the call: type byte 1 and the item.
    using MessageCallback = std::function<void(ByteView message)>;

    // Asks for the codes from its making to its end.
    class Listener
    {
    public:
        ~Listener();
        Listener(const Listener&) = delete;
        Listener& operator=(const Listener&) = delete;

    private:
        friend class DiagnosticModem;
        Listener(DiagnosticModem& modem, LogCodes codes, MessageCallback callback);

        DiagnosticModem& _modem;
        const LogCodes _codes;
        const MessageCallback _callback;
    };

    // The queue is not owned and must outlive the modem.
    DiagnosticModem(MainQueue& queue, OpenByteDevice open, Settings settings);
    ~DiagnosticModem();
    DiagnosticModem(const DiagnosticModem&) = delete;
    DiagnosticModem& operator=(const DiagnosticModem&) = delete;

    void setEvents(Events events) { _events = std::move(events); }

    // Opens the device, and from then on whenever it has gone away. Returns what is wrong, as one
    // line, when it cannot be opened now; then nothing has begun.
    std::optional<std::string> start();
    // Switches all log codes off, closes the device and calls `done`: never from within this call,
    // at the latest after a few seconds if the modem does not answer. Not to be called twice.
    void stop(std::function<void()> done);

    // The technology's constant. An empty text while it is not known: it is then found out.
    std::string technology() { return _technology.ask(); }
    // What a service knows of the modem's technology now: the constant, or nullopt where it does
    // not know.
    void tellTechnology(const std::optional<std::string>& technology)
    {
        _technology.tell(technology);
    }
    [[nodiscard]] Presence presence() const { return _presence; }
    // The listener must not outlive the modem. The callback must not destroy its own listener.
    [[nodiscard]] std::unique_ptr<Listener> listen(LogCodes codes, MessageCallback callback);

private:
    void add(Listener* listener);
    void remove(Listener* listener);
    void updateCodes();

    bool openPort(std::string& error);
    void lookAgain();
    void portFailed(const std::string& reason);
    void closePort();
    void setPresence(Presence presence);
    void tellMissing(const std::vector<std::uint16_t>& codes);
    void tellOnce(const std::string& line);
    void take(ByteView item);

    MainQueue& _queue;
    OpenByteDevice _open;
    const std::string _device;
    Events _events;
    ModemTechnology _technology;
    std::unique_ptr<DiagnosticPort> _port;
    LogCodes _probedCodes;
    std::vector<Listener*> _listeners; // null where one has gone during a call
    int _calls = 0;                    // of listeners under way
    Presence _presence = Presence::Unknown;
    bool _isStopping = false;
    std::string _lastTrouble; // the last line about a device that is not there
    std::set<std::uint16_t> _toldMissing;
    std::set<std::string> _told;
    Bytes _message; // kept for its memory
    const Lifetime _lifetime;
};

} // namespace orvane
