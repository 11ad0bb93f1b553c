#include "LogGenerator/LogTechnology.h"
#include "platform/base/Bytes.h"
#include "platform/linux/LineReader.h"
#include "platform/linux/PortsDirectory.h"
#include "platform/linux/PrivatePortsDirectory.h"
#include "platform/linux/QtEventLoop.h"
#include "platform/linux/QtMainQueue.h"
#include "platform/linux/ResourceDirectory.h"
#include "platform/linux/SerialDevice.h"
#include "platform/linux/SignalWatcher.h"
#include "platform/linux/SocketTransport.h"
#include "platform/linux/StalePorts.h"
#include "platform/linux/StandardDescriptors.h"
#include "platform/services/Complaint.h"
#include "platform/services/FileSystem.h"
#include "platform/services/Services.h"
#include "telephonyd/DaemonOptions.h"
#include "telephonyd/LogServer.h"
#include "telephonyd/ModemSource.h"
#include "telephonyd/ReplaySource.h"
#include "telephonyd/TypedMessages.h"
#include "telephonyd/modem/DiagnosticModem.h"
#include "telephonyd/phone/Scenarios.h"

#include <chrono>
#include <cstdio>
#include <ctime>
#include <exception>
#include <filesystem>
#include <unistd.h>
#include <utility>

using namespace orvane;

namespace
{

constexpr int kFailure = 1;
constexpr int kUnusableArguments = 2;
constexpr auto kCleaningInterval = std::chrono::minutes(1);

void complain(const std::string& text) { printComplaint("telephonyd", text); }

// Null, with a complaint, when the recording cannot be served.
LogSourceFactory replayFactory(const DaemonOptions& options, MainQueue& queue)
{
    std::error_code error;
    auto content = std::filesystem::is_regular_file(*options.replay, error)
                       ? readFile(*options.replay)
                       : std::nullopt;
    if (!content) {
        complain("cannot read \"" + *options.replay +
                 "\": check that it is a file and may be read");
        return nullptr;
    }
    const auto technology = options.technology ? options.technology : technologyOfLog(*content);
    if (!technology) {
        complain("\"" + *options.replay +
                 "\" holds no log codes that tell its technology: name "
                 "it with --technology");
        return nullptr;
    }
    const auto file = std::make_shared<const Bytes>(std::move(*content));
    const ReplaySettings settings{*technology, options.speed, options.loops};
    return [file, settings, &queue] {
        const auto now = [] {
            return std::chrono::nanoseconds(std::chrono::steady_clock::now().time_since_epoch());
        };
        return std::make_unique<ReplaySource>(queue, now, file, settings);
    };
}

std::unique_ptr<DiagnosticModem> modemOf(const DaemonOptions& options, MainQueue& queue)
{
    const auto open = [device = *options.port](std::string& error) {
        return openSerialDevice(device, error);
    };
    return std::make_unique<DiagnosticModem>(
        queue, open, DiagnosticModem::Settings{*options.port, options.technology});
}

// What the server tells its clients of the modem. Both must outlive the modem's events.
DiagnosticModem::Events eventsFor(LogServer& server, const DiagnosticModem& modem)
{
    return {[&server] { server.technologyChanged(); },
            [&server, &modem] {
                server.setModemMissing(modem.presence() == DiagnosticModem::Presence::Missing);
            }};
}

int serve(const DaemonOptions& options)
{
    std::string error;
    const auto directory = PortsDirectory::open(options.ports, error);
    if (!directory) {
        complain(error);
        return kFailure;
    }
    QtEventLoop loop;
    QtMainQueue queue;
    SocketTransport transport(*directory);
    std::unique_ptr<TypedMessages> messages;
    std::unique_ptr<LineReader> reader;
    std::unique_ptr<DiagnosticModem> modem;
    LogSourceFactory factory;
    if (options.port) {
        modem = modemOf(options, queue);
        factory = [&modem] { return std::make_unique<ModemSource>(*modem); };
    } else if (options.messages) {
        messages = std::make_unique<TypedMessages>(*options.messages, queue, complain);
        factory = messages->sources();
    } else {
        factory =
            options.demo ? phoneSourceFactory(*options.demo, queue) : replayFactory(options, queue);
    }
    if (!factory)
        return kFailure;
    LogServer server(transport, queue, std::move(factory));
    if (const auto failure = server.start()) {
        complain(*failure);
        return kFailure;
    }
    // Begun after the server, so that a wrong line does not hide why there is none.
    if (messages)
        reader = std::make_unique<LineReader>(
            STDIN_FILENO, [&messages](std::string_view line, bool wasCut) {
                if (wasCut)
                    complain("a line is too long: a message of at most 32,000 bytes fits into one");
                else
                    messages->take(line);
            });
    // What killed viewers leave does not wait for the next start.
    const auto removeLeftovers = [&directory] {
        removeStalePorts(*directory, StalePorts::All, std::time(nullptr));
        PrivatePortsDirectory::removeAbandoned(std::time(nullptr));
    };
    removeLeftovers();
    const auto cleaning = queue.repeatingTimer(kCleaningInterval, removeLeftovers);
    if (modem) {
        modem->setEvents(eventsFor(server, *modem));
        if (const auto failure = modem->start()) {
            complain(*failure);
            return kFailure;
        }
    }
    bool isEnding = false;
    const SignalWatcher signals([&](int) {
        // The modem is left as it was found; a second signal does not wait for that.
        if (!modem || std::exchange(isEnding, true)) {
            loop.quit();
            return;
        }
        server.stop();
        modem->stop([&loop] { loop.quit(); });
    });
    logLine(LogPriority::Notice, "Serving in %s", directory->path().c_str());
    return loop.run();
}

} // namespace

int main(int argc, char** argv)
{
    prepareStandardDescriptors();
    const std::vector<std::string> arguments(argv + (argc > 0 ? 1 : 0), argv + argc);
    const std::vector<std::string> scenarios = scenarioNames();
    const DaemonOptions options = parseDaemonOptions(arguments, scenarios);
    if (options.error) {
        complain(*options.error);
        return kUnusableArguments;
    }
    if (options.wantsHelp) {
        std::fputs(daemonHelp(scenarios).c_str(), stdout);
        return 0;
    }
    if (options.wantsVersion) {
        std::puts("telephonyd " ORVANE_VERSION);
        return 0;
    }
    // Some generators, who are asked for their log codes, come with their templates only.
    DirectoryResources resources(resourceDirectory(ORVANE_SHARE, ORVANE_SOURCE_RESOURCES));
    Services& services = Services::current();
    const auto log = makeLog(options.log, "telephonyd");
    services.setLog(log.get());
    services.setResources(&resources);
    int status = kFailure;
    try {
        status = serve(options);
    } catch (const std::exception& failure) {
        complain(failure.what());
    }
    services.setLog(nullptr);
    services.setResources(nullptr);
    return status;
}
