#pragma once

#include "platform/base/Bytes.h"
#include "platform/ports/FrameConnection.h"
#include "platform/services/Lifetime.h"
#include "platform/services/MainQueue.h"
#include "telephonyd/HalfFrameWatch.h"
#include "telephonyd/phone/LogSource.h"

#include <cstdint>
#include <map>
#include <memory>
#include <optional>
#include <string>

namespace orvane
{

class LogChannel;

// A telephony server: gives clients log channels whose messages come from a simulated phone, a
// recording or a modem. Serves any number of clients on one queue.
class LogServer
{
public:
    // Errors of a request for a channel; 0 is success.
    static constexpr std::int32_t kBadRequest = 1;
    static constexpr std::int32_t kClientUnreachable = 2;
    static constexpr std::int32_t kNoChannel = 3; // too many, or none can be made

    static constexpr std::size_t kMostChannels = 100;

    // Neither is owned; both must outlive the server. There is no channel if the factory makes no
    // source.
    LogServer(FrameTransport& transport, MainQueue& queue, LogSourceFactory makeSource);
    // stop().
    ~LogServer();
    LogServer(const LogServer&) = delete;
    LogServer& operator=(const LogServer&) = delete;

    // Listens as the telephony server. Returns what is wrong if it cannot.
    std::optional<std::string> start();
    // Closes all channels and connections. Must not be called from within a source's call.
    void stop();

    // Closes all channels, whose clients then ask for the technology anew, and notifies all
    // clients. Not to be called from within a call of a channel's source.
    void technologyChanged();
    // Tells all clients, and those that come later, that the modem is missing; or, after that, that
    // it is there again. At first it is not missing.
    void setModemMissing(bool isMissing);

    [[nodiscard]] std::size_t channelCount() const { return _channels.size(); }
    [[nodiscard]] std::size_t clientCount() const { return _clients.size(); }

private:
    using ClientId = std::uint64_t;
    using ChannelNumber = std::uint64_t;

    struct Client {
        std::unique_ptr<FrameConnection> connection;
        HalfFrameWatch watch;
    };

    void accept(std::unique_ptr<FrameConnection> connection);
    void checkClients();
    void take(ClientId client, const FrameReader::View& frame);
    Bytes replyToRequest(ClientId client, ByteView request);
    // 0 or an error.
    std::int32_t openChannel(ClientId client, const std::string& clientPort, std::string& port);
    void channelEnded(ChannelNumber number);
    void channelStarted(ClientId client);
    void notify(ClientId client, const char* name);
    void notifyAll(const char* name);

    FrameTransport& _transport;
    MainQueue& _queue;
    LogSourceFactory _makeSource;
    std::unique_ptr<FrameListener> _listener;
    std::map<ClientId, Client> _clients;
    std::unique_ptr<Timer> _clientCheck; // while there are clients or channels
    std::map<ChannelNumber, std::unique_ptr<LogChannel>> _channels;
    ClientId _lastClient = 0;
    ChannelNumber _lastChannel = 0;
    bool _isModemMissing = false;
    Lifetime _lifetime;
};

} // namespace orvane
