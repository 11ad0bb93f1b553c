#pragma once

#include "doubles/LoopbackTransport.h"
#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"
#include "platform/plist/PropertyList.h"

#include <gtest/gtest.h>

#include <set>

namespace orvane
{

inline Bytes bytesOf(std::string_view text) { return Bytes(text.begin(), text.end()); }

inline Bytes xmlOf(const PropertyValue& value)
{
    return bytesOf(writeXmlPropertyList(value).value());
}

inline PropertyValue codeArray(const std::set<std::uint32_t>& codes)
{
    auto array = PropertyValue::newArray();
    for (const std::uint32_t code : codes)
        array.asArray()->append(PropertyValue::integer(code));
    return array;
}

inline PropertyValue startCommand(const std::set<std::uint32_t>& modemCodes,
                                  const std::set<std::uint32_t>& extraCodes = {})
{
    return PropertyValue::dictionaryOf({
        {"SetState",          "Streaming"          },
        {"SetVarnelLogCodes", codeArray(modemCodes)},
        {"SetTsExtraCodes",   codeArray(extraCodes)},
    });
}

// A client of a telephony server on a loopback transport, which sends and reads plain frames.
// Nothing arrives before the queues run.
class TelephonyClient
{
public:
    struct Frame {
        std::int32_t messageId;
        std::uint32_t serial;
        bool wantsReply;
        bool isReply;
        Bytes data;
    };

    TelephonyClient(LoopbackTransport& loopback, std::string portName)
        : _transport(loopback.peerSide()), _portName(std::move(portName))
    {
        std::string error;
        _port = _transport.listen(_portName, error);
        _port->setConnectionCallback([this](auto connection) {
            fromServer.push_back(std::move(connection));
            fromServer.back()->setFrameCallback([this](const FrameReader::View& frame) {
                EXPECT_EQ(frame.messageId, 0);
                EXPECT_FALSE(frame.wantsReply || frame.isReply);
                messages.emplace_back(frame.data.begin(), frame.data.end());
            });
            fromServer.back()->setClosedCallback([] {});
        });
        server = connect(kTelephonyServerPort, serverFrames);
    }

    // Connects and asks for a channel; the port's name is then in channelPort().
    void requestChannel()
    {
        request(xmlOf(PropertyValue::dictionaryOf({
            {kCreateLogChannelKey, _portName}
        })));
    }
    void request(const Bytes& data)
    {
        ASSERT_TRUE(server);
        server->send(kCreateLogChannelMessage, 5, true, false, data);
    }
    [[nodiscard]] PropertyValue answer() const
    {
        for (auto frame = serverFrames.rbegin(); frame != serverFrames.rend(); ++frame)
            if (frame->isReply)
                return readPropertyList(frame->data).value;
        return {};
    }
    [[nodiscard]] std::string channelPort() const
    {
        const PropertyValue found = answer();
        const std::string* port = found[kLogChannelPortKey].asString();
        return port ? *port : "";
    }
    [[nodiscard]] std::vector<std::string> notifications() const
    {
        std::vector<std::string> names;
        for (const Frame& frame : serverFrames)
            if (!frame.isReply && frame.messageId == kNotificationMessage) {
                const PropertyValue read = readPropertyList(frame.data).value;
                names.push_back(read[kNotificationNameKey].description());
            }
        return names;
    }

    void connectToChannel() { channel = connect(channelPort(), channelFrames); }
    void command(const PropertyValue& value, bool wantsReply = false)
    {
        ASSERT_TRUE(channel);
        channel->send(0, 9, wantsReply, false, xmlOf(value));
    }

    std::unique_ptr<FrameConnection> connect(const std::string& name, std::vector<Frame>& frames)
    {
        std::string error;
        auto connection = _transport.connect(name, error);
        if (!connection)
            return nullptr;
        connection->setFrameCallback([&frames](const FrameReader::View& frame) {
            frames.push_back({frame.messageId, frame.serial, frame.wantsReply, frame.isReply,
                              Bytes(frame.data.begin(), frame.data.end())});
        });
        connection->setClosedCallback([] {});
        return connection;
    }

    void closePort()
    {
        fromServer.clear();
        _port.reset();
    }

    std::vector<Frame> serverFrames;
    std::vector<Frame> channelFrames;
    std::vector<Bytes> messages;
    std::unique_ptr<FrameConnection> server;
    std::unique_ptr<FrameConnection> channel;
    std::vector<std::unique_ptr<FrameConnection>> fromServer;

private:
    FrameTransport& _transport;
    std::string _portName;
    std::unique_ptr<FrameListener> _port;
};

} // namespace orvane
