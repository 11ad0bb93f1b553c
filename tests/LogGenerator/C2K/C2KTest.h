#pragma once

#include "LogGenerator/C2K/C2KLogGenerator.h"

#include "LogGenerator/StateKeys.h"
#include "LogGenerator/support/PacketBuilder.h"
#include "platform/base/PropertyValue.h"
#include "support/Recording.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>

namespace orvane
{

// A generator whose template shows each state key in a row of that name.
class C2KTest : public ::testing::Test
{
protected:
    C2KTest()
    {
        std::string text = "<plist><dict>";
        for (const char* key : {"kChannel",         "k1xEVDODeviceState",
                                "kBandClass",       "kRxAGC0",
                                "kRxAGC1",          "kTxAGC",
                                "kServingPNOffset", "kSessionState",
                                "kUATI24",          "kColorCode",
                                "kActiveSetPilots", "kFingerC2I",
                                "k1xDeviceState",   "k1xRx0BandClass",
                                "k1xRx0ChanNum",    "k1xRxAGC0",
                                "k1xRx1BandClass",  "k1xRx1ChanNum",
                                "k1xRxAGC1",        "k1xTxAGC",
                                "k1xTrafficFER",    "k1xActiveSetInfo",
                                "kFLDataRate",      "kRLDataRate",
                                "k1xRoamingHome",   "kSystemId",
                                "kNetworkId",       "kPacketZoneId",
                                "kBaseId",          "kProtocolRevision"})
            text += "<key>" + std::string(key) + "</key><string>" + key + "</string>";
        services.memoryResources.put("C2KTemplate.plist", text + "</dict></plist>");
        generator.init();
        C2KLogGenerator::getDisplayFromState(state);
        services.log.lines.clear();
    }

    // Sends an exactly sized copy, so that the address sanitizer sees one byte too many.
    void send(const Bytes& packet)
    {
        const Bytes exact(packet.begin(), packet.end());
        generator.updateState(state, exact);
    }
    // The same, cut to the first `size` bytes.
    void sendCut(const Bytes& packet, std::size_t size)
    {
        send(Bytes(packet.begin(), packet.begin() + static_cast<std::ptrdiff_t>(size)));
    }
    [[nodiscard]] std::string row(std::string_view key) const
    {
        return state[kDisplayKey][key].description();
    }
    // The rows of a dictionary value without its "_sorted", "KEY=VALUE" each.
    [[nodiscard]] std::vector<std::string> sortedRows(std::string_view key) const
    {
        std::vector<std::string> rows;
        const PropertyDictionary* dictionary = state[kDisplayKey][key].asDictionary();
        if (!dictionary || (*dictionary)["_sorted"] != PropertyValue("_sorted"))
            return {"(no sorted dictionary)"};
        for (const auto& [name, value] : *dictionary)
            if (name != "_sorted")
                rows.push_back(name + "=" + value.description());
        return rows;
    }

    TestServices services;
    PropertyDictionary state;
    C2KLogGenerator generator;
};

} // namespace orvane
