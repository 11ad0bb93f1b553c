#include "telephonyd/modem/ModemTechnology.h"

#include "platform/base/Technology.h"
#include "platform/base/TelephonyConstants.h"
#include "platform/services/SystemLog.h"

#include <utility>

namespace orvane
{

ModemTechnology::ModemTechnology(MainQueue& queue, std::optional<std::string> named, Events events)
    : _queue(queue), _isNamed(named.has_value()), _events(std::move(events)),
      _probe(queue, [this](const LogCodes& codes) { _events.watch(codes); }),
      _known(named.value_or(""))
{
}

std::string ModemTechnology::ask()
{
    // Without a modem the last known one lets the viewer stay, and say that the modem is missing.
    if (_isNamed || _isTold || _isConfirmed || (!_isPresent && !_known.empty()))
        return _known;
    probeWhileClientsWait();
    return "";
}

void ModemTechnology::tell(const std::optional<std::string>& technology)
{
    if (_isNamed)
        return;
    _isTold = technology.has_value();
    // Services do not tell these two apart.
    const bool isCloser = _known == kTSLogChannelTechnology_Varnel_UTRAN2 && _isConfirmed &&
                          technology == kTSLogChannelTechnology_Varnel_GSM;
    if (technology && !isCloser && (technology != _known || !_isConfirmed))
        found(*technology);
}

void ModemTechnology::modemCame()
{
    _isPresent = true;
    watchForSilence();
}

void ModemTechnology::modemWent()
{
    _isPresent = false;
    _isConfirmed = false;
    ++_silences;
}

void ModemTechnology::itemCame(std::uint16_t code, bool isListenedTo)
{
    if (_isNamed || _isTold || _isConfirmed)
        return;
    if (_probe.isShownBy(code))
        found(_probe.technology());
    else if (isListenedTo && !_known.empty())
        found(_known);
}

void ModemTechnology::setIsListenedTo(bool isListenedTo)
{
    if (std::exchange(_isListenedTo, isListenedTo) != isListenedTo)
        watchForSilence();
}

void ModemTechnology::found(const std::string& technology)
{
    const bool isOther = !_known.empty() && technology != _known;
    _known = technology;
    _isConfirmed = true;
    ++_silences;
    _probe.stop();
    logLine(LogPriority::Info, "The modem serves %s", nameOfTechnology(technology).c_str());
    if (isOther)
        _events.changed();
}

void ModemTechnology::probeWhileClientsWait()
{
    _probe.start(_known);
    _queue.after(kPatience, _lifetime.whileAlive([this, question = ++_questions] {
        if (question == _questions)
            _probe.stop();
    }));
}

void ModemTechnology::watchForSilence()
{
    ++_silences;
    if (_isNamed || _isTold || _isConfirmed || !_isListenedTo || !_isPresent)
        return;
    _queue.after(kSilence, _lifetime.whileAlive([this, silence = _silences] {
        if (silence == _silences)
            silenceIsOver();
    }));
}

// One probe as long as for a client that waits, which takes every technology's turn, then another
// silence.
void ModemTechnology::silenceIsOver()
{
    probeWhileClientsWait();
    watchForSilence();
}

} // namespace orvane
