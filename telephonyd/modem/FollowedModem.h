#pragma once

#include "platform/services/ModemService.h"
#include "telephonyd/modem/ManagedModem.h"

#include <functional>
#include <optional>
#include <string>
#include <vector>

namespace orvane
{

// The modem of that ID; without an ID the only one there is. nullopt, with one line in `error` that
// says what to do, where there is none or more than one.
std::optional<ManagedModem> chosenModem(const std::vector<ManagedModem>& modems,
                                        const std::string& id, std::string& error);

// One modem that a service on the bus knows, as it changes, goes and comes back.
class FollowedModem
{
public:
    // The service is not owned and must outlive the object. `id` may be empty.
    FollowedModem(ModemService& service, std::string id);
    FollowedModem(const FollowedModem&) = delete;
    FollowedModem& operator=(const FollowedModem&) = delete;

    // Asks which modem it is, and calls `ready` once with nullopt, or with what is wrong as one
    // line: never from within this call.
    void start(std::function<void(std::optional<std::string> error)> ready);
    // Called when what the other functions return may have changed since start() was answered.
    void setChangedCallback(std::function<void()> callback) { _changed = std::move(callback); }

    [[nodiscard]] const std::string& id() const { return _id; }
    [[nodiscard]] bool isPresent() const { return _isPresent; }
    // Empty while the modem is not there, or has none.
    [[nodiscard]] const std::string& diagnosticPort() const { return _port; }
    // The constant; nullopt while it is not known.
    [[nodiscard]] const std::optional<std::string>& technology() const { return _technology; }

private:
    void ask();
    void answered(const PropertyValue& objects, const std::string& error);

    ModemService& _service;
    std::string _id;
    std::string _port;
    std::optional<std::string> _technology;
    std::function<void(std::optional<std::string>)> _ready;
    std::function<void()> _changed;
    bool _isPresent = false;
    bool _isAsking = false;
    bool _asksAgain = false; // something changed since it was asked
};

} // namespace orvane
