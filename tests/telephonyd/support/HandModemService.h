#pragma once

#include "platform/services/ModemService.h"

#include <string>
#include <utility>
#include <vector>

namespace orvane
{

// What a test's modem tells of itself on the bus.
struct BusModem {
    std::string path;
    std::string equipmentIdentifier;
    std::uint32_t accessTechnologies;
};

inline PropertyValue portOnBus(const char* name, std::int64_t type)
{
    return PropertyValue::arrayOf({name, PropertyValue::integer(type)});
}

inline PropertyValue objectsOf(const std::vector<BusModem>& modems)
{
    auto objects = PropertyValue::newDictionary();
    for (const BusModem& modem : modems) {
        const auto ports =
            PropertyValue::arrayOf({portOnBus("ttyUSB0", 4), portOnBus("ttyUSB1", 3)});
        auto properties = PropertyValue::newDictionary();
        PropertyDictionary& values = *properties.asDictionary();
        values.set("EquipmentIdentifier", modem.equipmentIdentifier);
        values.set("DeviceIdentifier", "device-" + modem.path);
        values.set("Manufacturer", "Maker");
        values.set("Model", "Model");
        values.set("State", PropertyValue::integer(8));
        values.set("AccessTechnologies", PropertyValue::integer(modem.accessTechnologies));
        values.set("Ports", ports);
        auto interfaces = PropertyValue::newDictionary();
        interfaces.asDictionary()->set("org.freedesktop.ModemManager1.Modem", properties);
        objects.asDictionary()->set(modem.path, interfaces);
    }
    return objects;
}

// A service that answers when a test tells it to.
class HandModemService final : public ModemService
{
public:
    void ask(Answer answer) override { questions.push_back(std::move(answer)); }
    void setChangedCallback(std::function<void()> callback) override
    {
        changed = std::move(callback);
    }
    // Answers the oldest question.
    void answer(const PropertyValue& objects) { reply(objects, ""); }
    void fail(const std::string& error) { reply({}, error); }

    std::vector<Answer> questions;
    std::function<void()> changed;

private:
    void reply(const PropertyValue& objects, const std::string& error)
    {
        const Answer answer = std::move(questions.front());
        questions.erase(questions.begin());
        answer(objects, error);
    }
};

} // namespace orvane
