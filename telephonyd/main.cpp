#include "LogGenerator/LogTechnology.h"
#include "dlf/FileWindow.h"
#include "platform/base/Bytes.h"
#include "platform/linux/LineReader.h"
#include "platform/linux/ModemManagerClient.h"
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
#include "platform/services/Services.h"
#include "telephonyd/DaemonOptions.h"
#include "telephonyd/LogServer.h"
#include "telephonyd/ModemSource.h"
#include "telephonyd/ReplaySource.h"
#include "telephonyd/TypedMessages.h"
#include "telephonyd/modem/DiagnosticModem.h"
#include "telephonyd/modem/FollowedModem.h"
#include "telephonyd/modem/ManagedModem.h"
#include "telephonyd/phone/Scenarios.h"

#include <chrono>
#include <cstdio>
#include <ctime>
#include <exception>
#include <unistd.h>
#include <utility>

using namespace orvane;

namespace
{

constexpr int kFailure = 1;
constexpr int kUnusableArguments = 2;
// More than ModemManager's answer is waited for.
constexpr std::chrono::seconds kServiceTime{10};
constexpr auto kCleaningInterval = std::chrono::minutes(1);

void complain(const std::string& text) { printComplaint("telephonyd", text); }

// Null, after printing why, if the recording cannot be served.
LogSourceFactory replayFactory(const DaemonOptions& options, MainQueue& queue)
{
    std::string reason;
    const auto file = FileWindow::open(*options.replay, reason);
    if (!file) {
        complain("cannot read \"" + *options.replay + "\" (" + reason +
                 "): check that it is a file and may be read");
        return nullptr;
    }
    const auto technology =
        options.technology ? options.technology : technologyOfItems(DlfReader(file));
    if (!technology) {
        complain("\"" + *options.replay +
                 "\" holds no log codes that tell its technology: name "
                 "it with --technology");
        return nullptr;
    }
    const ReplaySettings settings{*technology, options.speed, options.loops};
    // Each channel reads through a window of its own.
    return [file, settings, &queue]() -> std::unique_ptr<LogSource> {
        const auto now = [] {
            return std::chrono::nanoseconds(std::chrono::steady_clock::now().time_since_epoch());
        };
        auto window = file->another();
        if (!window)
            return nullptr;
        return std::make_unique<ReplaySource>(queue, now, std::move(window), settings);
    };
}

ModemManagerClient::Bus busOf(const DaemonOptions& options)
{
    return options.usesSessionBus ? ModemManagerClient::Bus::Session
                                  : ModemManagerClient::Bus::System;
}

int listModems(const DaemonOptions& options)
{
    QtEventLoop loop;
    ModemManagerClient service(busOf(options));
    std::optional<std::string> problem;
    service.ask([&](const PropertyValue& objects, const std::string& error) {
        problem = error;
        const auto modems = managedModemsIn(objects);
        const std::string text = !error.empty()        ? ""
                                 : options.listsAsJson ? modemListJson(modems)
                                                       : modemListText(modems);
        std::fputs(text.c_str(), stdout);
        loop.quit();
    });
    loop.run();
    if (problem->empty())
        return 0;
    complain("ModemManager cannot be asked: " + *problem);
    return kFailure;
}

// A modem with what it is opened and followed by.
struct ServedModem {
    std::unique_ptr<ModemManagerClient> service;
    std::unique_ptr<FollowedModem> followed;
    std::unique_ptr<DiagnosticModem> modem;
};

// The modem that ModemManager knows; null, with a complaint, when it does not.
std::unique_ptr<FollowedModem> followedModem(const DaemonOptions& options, ModemService& service,
                                             QtEventLoop& loop)
{
    auto followed = std::make_unique<FollowedModem>(service, *options.modem);
    std::optional<std::string> problem;
    bool isAnswered = false;
    followed->start([&](const std::optional<std::string>& error) {
        problem = error;
        isAnswered = true;
    });
    loop.runUntil([&] { return isAnswered; }, kServiceTime);
    // A diagnostic port that is named need not be listed.
    if (!isAnswered || (problem && !(options.port && followed->isPresent()))) {
        complain(problem.value_or("ModemManager does not answer: start it again, or name the "
                                  "diagnostic port with --port DEVICE"));
        return nullptr;
    }
    return followed;
}

// Without a modem, after a complaint, when it cannot be served.
ServedModem modemOf(const DaemonOptions& options, QtEventLoop& loop, MainQueue& queue)
{
    ServedModem served;
    if (options.modem) {
        served.service = std::make_unique<ModemManagerClient>(busOf(options));
        served.followed = followedModem(options, *served.service, loop);
        if (!served.followed)
            return served;
    }
    const FollowedModem* followed = served.followed.get();
    const auto open = [port = options.port,
                       followed](std::string& error) -> std::unique_ptr<ByteDevice> {
        const std::string device = port ? *port : followed->diagnosticPort();
        if (!device.empty())
            return openSerialDevice(device, error);
        error = "ModemManager does not list the diagnostic port of the modem " + followed->id() +
                " now";
        return nullptr;
    };
    const std::string device = options.port ? *options.port : followed->diagnosticPort();
    served.modem = std::make_unique<DiagnosticModem>(
        queue, open, DiagnosticModem::Settings{device, options.technology});
    if (served.followed) {
        const auto tell = [modem = served.modem.get(), followed] {
            modem->tellTechnology(followed->technology());
        };
        tell();
        served.followed->setChangedCallback(tell);
    }
    return served;
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
    ServedModem served;
    DiagnosticModem* modem = nullptr;
    LogSourceFactory factory;
    if (options.port || options.modem) {
        served = modemOf(options, loop, queue);
        modem = served.modem.get();
        if (modem)
            factory = [modem] { return std::make_unique<ModemSource>(*modem); };
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
    // Starts after the server, so that an error in a line does not hide why the server cannot
    // start.
    if (messages)
        reader = std::make_unique<LineReader>(
            STDIN_FILENO, [&messages](std::string_view line, bool wasCut) {
                if (wasCut)
                    complain("a line is too long: a message of at most 32,000 bytes fits into one");
                else
                    messages->take(line);
            });
    // Removes what killed viewers leave without waiting for the next start.
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
    // Some generators, which are asked for their log codes, need their templates.
    DirectoryResources resources(resourceDirectory(ORVANE_SHARE, ORVANE_SOURCE_RESOURCES));
    Services& services = Services::current();
    const auto log = makeLog(options.log, "telephonyd");
    services.setLog(log.get());
    services.setResources(&resources);
    int status = kFailure;
    try {
        status = options.listsModems ? listModems(options) : serve(options);
    } catch (const std::exception& failure) {
        complain(failure.what());
    }
    services.setLog(nullptr);
    services.setResources(nullptr);
    return status;
}
