// Frames over a real socket between two processes: small ones a second, bytes of large ones a
// second, and the time from a request to its answer.

#include "platform/linux/PrivatePortsDirectory.h"
#include "platform/linux/QtEventLoop.h"
#include "platform/linux/QtMainQueue.h"
#include "platform/linux/SocketTransport.h"

#include <benchmark/benchmark.h>

#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <functional>
#include <sys/prctl.h>
#include <sys/wait.h>
#include <unistd.h>

namespace
{

using namespace orvane;
using std::chrono::seconds;

constexpr const char* kPortName = "Sender";
constexpr std::size_t kQueueLimit = 256U * 1024;
constexpr std::size_t kSmallFrame = 60;

// The message id tells the sender how to send, the serial how many frames.
enum Request : std::int32_t { Burst = 1, OneATurn = 2, Large = 3, Echo = 4 };

// The other process: sends as it is asked to.
class Sender
{
public:
    explicit Sender(const PortsDirectory& directory) : _transport(directory)
    {
        std::string error;
        _listener = _transport.listen(kPortName, error);
        if (!_listener) {
            std::fprintf(stderr, "%s\n", error.c_str());
            std::_Exit(1);
        }
        _listener->setConnectionCallback([this](std::unique_ptr<FrameConnection> connection) {
            _connection = std::move(connection);
            _connection->setDrainedCallback([this] { sendMore(); });
            _connection->setFrameCallback([this](const FrameReader::View& request) {
                _request = request.messageId;
                _left = request.serial;
                sendMore();
            });
        });
    }

private:
    void sendMore()
    {
        if (_request == OneATurn) {
            sendOne();
            if (_left > 0 && _connection->queuedBytes() < kQueueLimit)
                _queue.async([this] { sendMore(); });
            return;
        }
        while (_left > 0 && _connection->queuedBytes() < kQueueLimit)
            sendOne();
    }

    void sendOne()
    {
        if (_left == 0)
            return;
        --_left;
        _connection->send(0, _left, false, _request == Echo, _request == Large ? _large : _small);
    }

    SocketTransport _transport;
    QtMainQueue _queue;
    std::unique_ptr<FrameListener> _listener;
    std::unique_ptr<FrameConnection> _connection;
    std::int32_t _request = 0;
    std::uint32_t _left = 0;
    Bytes _small = Bytes(kSmallFrame, 0x5a);
    Bytes _large = Bytes(1024 * 1024, 0x5a);
};

// Starts the other process. This must come before the first Qt object of this one.
class SenderProcess
{
public:
    SenderProcess() : _id(::fork())
    {
        if (_id != 0)
            return;
        ::prctl(PR_SET_PDEATHSIG, SIGKILL);
        QtEventLoop loop;
        const Sender sender(_directory.directory());
        std::_Exit(loop.run());
    }
    ~SenderProcess()
    {
        ::kill(_id, SIGKILL);
        ::waitpid(_id, nullptr, 0);
    }
    SenderProcess(const SenderProcess&) = delete;
    SenderProcess& operator=(const SenderProcess&) = delete;

    [[nodiscard]] const PortsDirectory& directory() const { return _directory.directory(); }

private:
    PrivatePortsDirectory _directory;
    pid_t _id;
};

class Receiver
{
public:
    explicit Receiver(const PortsDirectory& directory) : _transport(directory)
    {
        std::string error;
        QtMainQueue queue;
        const auto again = queue.repeatingTimer(std::chrono::milliseconds{5}, [] {});
        _loop.runUntil(
            [&] {
                _connection = _transport.connect(kPortName, error);
                return _connection != nullptr;
            },
            seconds{10});
        if (!_connection) {
            std::fprintf(stderr, "%s\n", error.c_str());
            std::_Exit(1);
        }
        _connection->setFrameCallback([this](const FrameReader::View& frame) {
            ++_received;
            benchmark::DoNotOptimize(frame.data.data());
        });
    }

    bool receive(Request request, std::uint32_t count)
    {
        _received = 0;
        _connection->send(request, count, false, false, {});
        const std::function<bool()> done = [&] { return _received == count; };
        return request == Echo ? _connection->waitUntil(done, seconds{10})
                               : _loop.runUntil(done, seconds{60});
    }

private:
    QtEventLoop _loop;
    SocketTransport _transport;
    std::unique_ptr<FrameConnection> _connection;
    std::uint32_t _received = 0;
};

void receiveFrames(benchmark::State& state, Request request, std::uint32_t count)
{
    static SenderProcess sender;
    static Receiver receiver(sender.directory());
    for (auto _ : state)
        if (!receiver.receive(request, count))
            state.SkipWithError("the frames did not come");
    state.SetItemsProcessed(state.iterations() * count);
}

void smallFramesInBursts(benchmark::State& state) { receiveFrames(state, Burst, 100000); }
void smallFramesOneATurn(benchmark::State& state) { receiveFrames(state, OneATurn, 100000); }
void largeFrames(benchmark::State& state)
{
    receiveFrames(state, Large, 64);
    state.SetBytesProcessed(state.iterations() * 64 * 1024 * 1024);
}
void roundTrip(benchmark::State& state) { receiveFrames(state, Echo, 1); }

BENCHMARK(smallFramesInBursts)->UseRealTime()->Unit(benchmark::kMillisecond);
BENCHMARK(smallFramesOneATurn)->UseRealTime()->Unit(benchmark::kMillisecond);
BENCHMARK(largeFrames)->UseRealTime()->Unit(benchmark::kMillisecond);
BENCHMARK(roundTrip)->UseRealTime()->Unit(benchmark::kMicrosecond);

} // namespace
