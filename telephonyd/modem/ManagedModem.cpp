#include "telephonyd/modem/ManagedModem.h"

#include "platform/base/JsonText.h"
#include "platform/base/Technology.h"
#include "platform/base/TelephonyConstants.h"

#include <algorithm>

namespace orvane
{

namespace
{

constexpr const char* kModemInterface = "org.freedesktop.ModemManager1.Modem";
constexpr std::int64_t kDiagnosticPortType = 4;
constexpr std::int64_t kDisabled = 3;

constexpr std::uint32_t bits(unsigned first, unsigned last)
{
    return ((1U << (last - first + 1)) - 1) << first;
}

// Bits of AccessTechnologies. A modem that uses several at once counts as the first of these. There
// are no log codes for one that uses 5G alone (bit 15).
constexpr struct {
    std::uint32_t bits;
    const char* technology;
} kAccessTechnologies[] = {
    {bits(14, 14) | bits(16, 17), kTSLogChannelTechnology_Varnel_LTE}, // LTE, LTE-M, NB-IoT
    {bits(1,       9),               kTSLogChannelTechnology_Varnel_GSM         }, // GSM to HSPA+
    {bits(10,       13),              kTSLogChannelTechnology_Varnel_CDMA}, // 1xRTT and EV-DO
};

constexpr struct {
    std::int64_t state;
    const char* name;
} kStates[] = {
    {-1,        "failed"       },
    {0,         "unknown"      },
    {1,         "initializing" },
    {2,         "locked"       },
    {kDisabled, "disabled"     },
    {4,         "disabling"    },
    {5,         "enabling"     },
    {6,         "enabled"      },
    {7,         "searching"    },
    {8,         "registered"   },
    {9,         "disconnecting"},
    {10,        "connecting"   },
    {11,        "connected"    },
};

std::string textOf(const PropertyValue& value)
{
    const std::string* text = value.asString();
    return text ? *text : "";
}

// Ports are structures of a name and a type.
std::vector<ManagedModem::Port> portsIn(const PropertyValue& value)
{
    std::vector<ManagedModem::Port> ports;
    const PropertyArray* array = value.asArray();
    if (!array)
        return ports;
    for (const PropertyValue& each : *array) {
        const PropertyArray* port = each.asArray();
        if (!port || port->size() < 2)
            continue;
        const std::string name = textOf((*port)[0]);
        if (!name.empty())
            ports.push_back({"/dev/" + name, (*port)[1].asInteger() == kDiagnosticPortType});
    }
    return ports;
}

ManagedModem modemOf(const std::string& path, const PropertyValue& properties)
{
    ManagedModem modem;
    modem.path = path;
    modem.id = textOf(properties["EquipmentIdentifier"]);
    if (modem.id.empty())
        modem.id = textOf(properties["DeviceIdentifier"]);
    modem.maker = textOf(properties["Manufacturer"]);
    modem.model = textOf(properties["Model"]);
    modem.state = properties["State"].asInteger().value_or(0);
    modem.accessTechnologies =
        static_cast<std::uint32_t>(properties["AccessTechnologies"].asInteger().value_or(0));
    modem.ports = portsIn(properties["Ports"]);
    return modem;
}

// What can be shown of the modem, or why not and what to do.
std::string logCodesText(const ManagedModem& modem)
{
    if (modem.diagnosticPort().empty())
        return "not shown: ModemManager lists no diagnostic port; if you know its device, run "
               "telephonyd --port DEVICE";
    return "shown by telephonyd --modem=" + modem.id;
}

std::string stateText(const ManagedModem& modem)
{
    return modem.stateName() +
           (modem.state == kDisabled ? "; enable it with mmcli -m " + modem.path + " -e" : "");
}

std::string portsText(const ManagedModem& modem)
{
    std::string text;
    for (const ManagedModem::Port& port : modem.ports)
        text +=
            (text.empty() ? "" : ", ") + port.device + (port.isDiagnostic ? " (diagnostic)" : "");
    return text;
}

std::string jsonString(std::string_view text)
{
    std::string json;
    appendJsonString(json, text);
    return json;
}

std::string technologyText(const ManagedModem& modem)
{
    const auto technology = modem.technology();
    return technology ? nameOfTechnology(*technology) : "";
}

} // namespace

std::string ManagedModem::diagnosticPort() const
{
    const auto found = std::find_if(ports.begin(), ports.end(),
                                    [](const Port& port) { return port.isDiagnostic; });
    return found == ports.end() ? "" : found->device;
}

std::string ManagedModem::stateName() const
{
    for (const auto& each : kStates)
        if (each.state == state)
            return each.name;
    return "state " + std::to_string(state);
}

std::optional<std::string> ManagedModem::technology() const
{
    for (const auto& each : kAccessTechnologies)
        if ((accessTechnologies & each.bits) != 0)
            return each.technology;
    return std::nullopt;
}

std::vector<ManagedModem> managedModemsIn(const PropertyValue& objects)
{
    std::vector<ManagedModem> modems;
    const PropertyDictionary* dictionary = objects.asDictionary();
    if (!dictionary)
        return modems;
    for (const auto& [path, interfaces] : *dictionary)
        if (const PropertyValue& properties = interfaces[kModemInterface])
            modems.push_back(modemOf(std::string(path), properties));
    std::sort(
        modems.begin(), modems.end(),
        [](const ManagedModem& left, const ManagedModem& right) { return left.path < right.path; });
    return modems;
}

std::string modemListText(const std::vector<ManagedModem>& modems)
{
    if (modems.empty())
        return "ModemManager knows no modem: plug one in, and wait until it has been recognised\n";
    std::string text;
    for (const ManagedModem& modem : modems) {
        const std::pair<const char*, std::string> lines[] = {
            {"ID",         modem.id             },
            {"maker",      modem.maker          },
            {"model",      modem.model          },
            {"state",      stateText(modem)     },
            {"technology", technologyText(modem)},
            {"ports",      portsText(modem)     },
            {"log codes",  logCodesText(modem)  },
        };
        text += text.empty() ? "" : "\n";
        for (const auto& [name, value] : lines)
            text += std::string(name) + ": " + (value.empty() ? "unknown" : value) + "\n";
    }
    return text;
}

std::string modemListJson(const std::vector<ManagedModem>& modems)
{
    std::string text;
    for (const ManagedModem& modem : modems) {
        const std::pair<const char*, std::string> members[] = {
            {"id",         modem.id             },
            {"maker",      modem.maker          },
            {"model",      modem.model          },
            {"state",      modem.stateName()    },
            {"technology", technologyText(modem)},
            {"log codes",  logCodesText(modem)  },
        };
        text += "{";
        for (const auto& [name, value] : members)
            text += jsonString(name) + ":" + jsonString(value) + ",";
        text += "\"ports\":[";
        for (const ManagedModem::Port& port : modem.ports)
            text += std::string(&port == modem.ports.data() ? "" : ",") +
                    "{\"device\":" + jsonString(port.device) +
                    ",\"diagnostic\":" + (port.isDiagnostic ? "true" : "false") + "}";
        text += "]}\n";
    }
    return text;
}

} // namespace orvane
