#pragma once

#include "platform/base/PropertyValue.h"

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

namespace orvane
{

// A modem as ModemManager describes it.
struct ManagedModem {
    struct Port {
        std::string device; // "/dev/ttyUSB0"
        bool isDiagnostic = false;
    };

    std::string path; // of its object on the bus
    // The equipment identifier (IMEI, MEID), else ModemManager's identifier of the device.
    std::string id;
    std::string maker;
    std::string model;
    std::int64_t state = 0;
    std::uint32_t accessTechnologies = 0; // bits
    std::vector<Port> ports;

    // The device of the diagnostic port; empty where the modem has none.
    [[nodiscard]] std::string diagnosticPort() const;
    // The state in words: "registered".
    [[nodiscard]] std::string stateName() const;
    // The constant of the technology that it uses now; nullopt where that is none or not known.
    [[nodiscard]] std::optional<std::string> technology() const;
};

// The modems among the objects that ModemManager manages (see ModemService), in the order of their
// paths. What is missing or of another type than expected stays empty.
std::vector<ManagedModem> managedModemsIn(const PropertyValue& objects);

// For people: a block of lines for each modem, or one line that says that there is none.
std::string modemListText(const std::vector<ManagedModem>& modems);
// For programs: a line of JSON for each modem.
std::string modemListJson(const std::vector<ManagedModem>& modems);

} // namespace orvane
