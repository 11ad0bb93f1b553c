#include "telephonyd/modem/DiagnosticModem.h"

#include "platform/base/Bytes.h"
#include "platform/base/LogMessage.h"
#include "platform/base/PacketView.h"
#include "platform/services/SystemLog.h"

#include <algorithm>
#include <cstdio>
#include <utility>

namespace orvane
{

namespace
{

std::string codeText(std::uint16_t code)
{
    char text[8];
    std::snprintf(text, sizeof text, "0x%04X", static_cast<unsigned>(code));
    return text;
}

} // namespace

DiagnosticModem::Listener::Listener(DiagnosticModem& modem, LogCodes codes,
                                    MessageCallback callback)
    : _modem(modem), _codes(std::move(codes)), _callback(std::move(callback))
{
    _modem.add(this);
}

DiagnosticModem::Listener::~Listener() { _modem.remove(this); }

DiagnosticModem::DiagnosticModem(MainQueue& queue, OpenByteDevice open, Settings settings)
    : _queue(queue), _open(std::move(open)), _device(std::move(settings.device)),
      _technology(queue, std::move(settings.technology),
                  {[this](const LogCodes& codes) {
                       _probedCodes = codes;
                       updateCodes();
                   },
                   [this] {
                       if (_events.technologyChanged)
                           _events.technologyChanged();
                   }})
{
}

DiagnosticModem::~DiagnosticModem() = default;

std::optional<std::string> DiagnosticModem::start()
{
    std::string error;
    if (openPort(error))
        return std::nullopt;
    return error;
}

void DiagnosticModem::stop(std::function<void()> done)
{
    _isStopping = true;
    auto close = [this, done = std::move(done)] {
        closePort();
        done();
    };
    if (_port)
        _port->finish(std::move(close));
    else
        _queue.async(_lifetime.whileAlive(std::move(close)));
}

std::unique_ptr<DiagnosticModem::Listener> DiagnosticModem::listen(LogCodes codes,
                                                                   MessageCallback callback)
{
    return std::unique_ptr<Listener>(new Listener(*this, std::move(codes), std::move(callback)));
}

void DiagnosticModem::add(Listener* listener)
{
    _listeners.push_back(listener);
    updateCodes();
    _technology.setIsListenedTo(true);
}

void DiagnosticModem::remove(Listener* listener)
{
    std::replace(_listeners.begin(), _listeners.end(), listener, static_cast<Listener*>(nullptr));
    if (_calls == 0)
        std::erase(_listeners, nullptr);
    updateCodes();
    const auto count = std::count(_listeners.begin(), _listeners.end(), nullptr);
    _technology.setIsListenedTo(static_cast<std::size_t>(count) < _listeners.size());
}

void DiagnosticModem::updateCodes()
{
    if (!_port)
        return;
    LogCodes all = _probedCodes;
    for (const Listener* listener : _listeners)
        if (listener)
            all.insert(listener->_codes.begin(), listener->_codes.end());
    _port->setWantedCodes(std::move(all));
}

bool DiagnosticModem::openPort(std::string& error)
{
    auto device = _open(error);
    if (!device)
        return false;
    DiagnosticPort::Events events;
    events.item = [this](ByteView item) { take(item); };
    events.ready = [this] { setPresence(Presence::Present); };
    events.settled = [this] { _technology.codesSettled(); };
    events.missing = [this](const std::vector<std::uint16_t>& codes) { tellMissing(codes); };
    events.refused = [this](const std::string& what) {
        tellOnce("The modem at " + _device + " refuses " + what);
    };
    events.failed = [this](const std::string& reason) { portFailed(reason); };
    _port = std::make_unique<DiagnosticPort>(_queue, std::move(device), std::move(events));
    updateCodes();
    return true;
}

void DiagnosticModem::lookAgain()
{
    _queue.after(kLookAgain, _lifetime.whileAlive([this] {
        if (_isStopping)
            return;
        std::string error;
        if (openPort(error))
            return;
        if (std::exchange(_lastTrouble, error) != error)
            logWarning("%s", error.c_str());
        lookAgain();
    }));
}

void DiagnosticModem::portFailed(const std::string& reason)
{
    const std::string line = "No modem at " + _device + ": " + reason;
    if (std::exchange(_lastTrouble, line) != line)
        logWarning("%s; looking for it every %d seconds", line.c_str(),
                   static_cast<int>(kLookAgain.count()));
    closePort();
    setPresence(Presence::Missing);
    lookAgain();
}

void DiagnosticModem::closePort()
{
    if (!_port)
        return;
    const DiagnosticPort::Counts counts = _port->counts();
    _port.reset();
    if (counts.damagedFrames + counts.damagedItems > 0)
        logLine(LogPriority::Notice,
                "%s: %llu log items came; %llu frames and %llu log items were damaged and dropped",
                _device.c_str(), static_cast<unsigned long long>(counts.items),
                static_cast<unsigned long long>(counts.damagedFrames),
                static_cast<unsigned long long>(counts.damagedItems));
}

void DiagnosticModem::setPresence(Presence presence)
{
    if (std::exchange(_presence, presence) == presence)
        return;
    if (presence == Presence::Present) {
        _lastTrouble.clear();
        logLine(LogPriority::Notice, "The modem at %s answers", _device.c_str());
        _technology.modemCame();
    } else
        _technology.modemWent();
    if (_events.presenceChanged)
        _events.presenceChanged();
}

void DiagnosticModem::tellMissing(const std::vector<std::uint16_t>& codes)
{
    std::string text;
    for (const std::uint16_t code : codes)
        if (_toldMissing.insert(code).second)
            text += (text.empty() ? "" : ", ") + codeText(code);
    if (!text.empty())
        logWarning("The modem at %s does not have the log codes %s; their rows stay empty",
                   _device.c_str(), text.c_str());
}

void DiagnosticModem::tellOnce(const std::string& line)
{
    if (_told.insert(line).second)
        logWarning("%s", line.c_str());
}

void DiagnosticModem::take(ByteView item)
{
    const auto code = static_cast<std::uint16_t>(PacketView(item).unsignedAt(2, 2).value_or(0));
    bool isListenedTo = false;
    ++_calls;
    // By index: a callback may add a listener.
    for (std::size_t i = 0; i < _listeners.size(); ++i) {
        if (!_listeners[i] || !_listeners[i]->_codes.contains(code))
            continue;
        if (!std::exchange(isListenedTo, true)) {
            _message.assign(1, kModemItem);
            _message.insert(_message.end(), item.begin(), item.end());
        }
        _listeners[i]->_callback(_message);
    }
    if (--_calls == 0)
        std::erase(_listeners, nullptr);
    _technology.itemCame(code, isListenedTo);
}

} // namespace orvane
