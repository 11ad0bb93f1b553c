// Clients of a telephony server that send requests, commands and other bytes to the server's port
// and to the port of a channel.

#include "doubles/LoopbackTransport.h"
#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"
#include "platform/plist/PropertyList.h"
#include "platform/ports/TelephonyServer.h"
#include "platform/services/Services.h"
#include "telephonyd/LogServer.h"
#include "telephonyd/phone/Scenarios.h"

#include <algorithm>

using namespace orvane;

namespace
{

using namespace std::chrono_literals;

class Input
{
public:
    explicit Input(ByteView bytes) : _bytes(bytes) {}
    [[nodiscard]] bool isEmpty() const { return _bytes.empty(); }
    std::uint8_t byte()
    {
        if (_bytes.empty())
            return 0;
        const std::uint8_t value = _bytes.front();
        _bytes = _bytes.subspan(1);
        return value;
    }
    // A length byte (in steps of 4), then that many bytes.
    ByteView block()
    {
        const std::size_t size = std::min<std::size_t>(std::size_t{4} * byte(), _bytes.size());
        const ByteView taken = _bytes.first(size);
        _bytes = _bytes.subspan(size);
        return taken;
    }

private:
    ByteView _bytes;
};

std::unique_ptr<FrameConnection> connect(FrameTransport& transport, const std::string& name)
{
    std::string error;
    auto connection = transport.connect(name, error);
    if (connection) {
        connection->setFrameCallback([](const FrameReader::View&) {});
        connection->setClosedCallback([] {});
    }
    return connection;
}

Bytes channelRequest()
{
    const std::string text = writeXmlPropertyList(PropertyValue::dictionaryOf({
                                                      {kCreateLogChannelKey, "client"}
    }))
                                 .value();
    return Bytes(text.begin(), text.end());
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    ManualMainQueue queue;
    LoopbackTransport transport(queue);
    LogServer server(transport, queue, phoneSourceFactory("lte", queue));
    if (server.start())
        return 0;

    std::string error;
    const auto clientPort = transport.peerSide().listen("client", error);
    std::vector<std::unique_ptr<FrameConnection>> taken;
    clientPort->setConnectionCallback([&taken](auto connection) {
        taken.push_back(std::move(connection));
        taken.back()->setFrameCallback([](const FrameReader::View&) {});
    });
    auto toServer = connect(transport.peerSide(), kTelephonyServerPort);
    toServer->send(kCreateLogChannelMessage, 1, true, false, channelRequest());
    queue.runPending();
    auto toChannel = connect(transport.peerSide(), "TelephonyServer.Channel.1");

    Input input(ByteView(data, size));
    while (!input.isEmpty()) {
        const std::uint8_t what = input.byte();
        const auto& connection = (what & 1) != 0 ? toChannel : toServer;
        const std::int32_t messageId = input.byte() % 4;
        switch (what >> 1 & 7) {
        case 0: // bytes as they come
            (what & 1) != 0 ? transport.injectToPort("TelephonyServer.Channel.1", input.block())
                            : transport.injectToPort(kTelephonyServerPort, input.block());
            break;
        case 1:
            queue.advance(std::chrono::milliseconds(input.byte()));
            break;
        case 2:
            taken.clear();
            break;
        case 3:
            toServer->send(kCreateLogChannelMessage, 2, true, false, channelRequest());
            break;
        default:
            if (connection)
                connection->send(messageId, 1, (what & 0x20) != 0, (what & 0x40) != 0,
                                 input.block());
        }
        queue.runPending();
    }
    queue.advance(1s);
    return 0;
}
