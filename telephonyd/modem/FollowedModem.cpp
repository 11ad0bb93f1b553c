#include "telephonyd/modem/FollowedModem.h"

#include <algorithm>
#include <utility>

namespace orvane
{

namespace
{

std::string idsOf(const std::vector<ManagedModem>& modems)
{
    std::string ids;
    for (const ManagedModem& modem : modems)
        ids += (ids.empty() ? "" : ", ") + modem.id + " (" + modem.maker + " " + modem.model + ")";
    return ids;
}

} // namespace

std::optional<ManagedModem> chosenModem(const std::vector<ManagedModem>& modems,
                                        const std::string& id, std::string& error)
{
    const auto found =
        id.empty() ? modems.begin()
                   : std::find_if(modems.begin(), modems.end(),
                                  [&](const ManagedModem& modem) { return modem.id == id; });
    if (modems.empty())
        error = "ModemManager knows no modem: plug one in, or name its diagnostic port with "
                "--port DEVICE";
    else if (found == modems.end())
        error = "ModemManager knows no modem \"" + id + "\", but " + idsOf(modems) +
                ": give one of these as --modem=ID";
    else if (id.empty() && modems.size() > 1)
        error = "there are several modems: give one of " + idsOf(modems) + " as --modem=ID";
    else
        return *found;
    return std::nullopt;
}

FollowedModem::FollowedModem(ModemService& service, std::string id)
    : _service(service), _id(std::move(id))
{
    _service.setChangedCallback([this] { ask(); });
}

void FollowedModem::start(std::function<void(std::optional<std::string>)> ready)
{
    _ready = std::move(ready);
    ask();
}

void FollowedModem::ask()
{
    _asksAgain = _isAsking;
    if (std::exchange(_isAsking, true))
        return;
    _service.ask([this](const PropertyValue& objects, const std::string& error) {
        _isAsking = false;
        answered(objects, error);
        if (std::exchange(_asksAgain, false))
            ask();
    });
}

void FollowedModem::answered(const PropertyValue& objects, const std::string& error)
{
    std::string problem = "ModemManager cannot be asked: " + error;
    const auto modem =
        error.empty() ? chosenModem(managedModemsIn(objects), _id, problem) : std::nullopt;
    const std::string port = modem ? modem->diagnosticPort() : "";
    const auto technology = modem ? modem->technology() : std::nullopt;
    const bool isChanged = port != _port || technology != _technology;
    _isPresent = modem.has_value();
    _port = port;
    _technology = technology;
    if (modem)
        _id = modem->id; // another one that comes while it is away is not it
    if (!_ready) {
        if (isChanged && _changed)
            _changed();
        return;
    }
    const auto ready = std::exchange(_ready, nullptr);
    if (modem && port.empty())
        problem = "ModemManager lists no diagnostic port of the modem " + _id +
                  ": if you know its device, give it as --port DEVICE";
    ready(port.empty() ? std::optional(problem) : std::nullopt);
}

} // namespace orvane
