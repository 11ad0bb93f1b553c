#include "app/AppOptions.h"
#include "app/CommandInterpreter.h"
#include "app/OrvaneApp.h"
#include "platform/FramePorts.h"
#include "platform/FrameTelephonyServer.h"
#include "platform/OutputDescriptor.h"
#include "platform/Services.h"
#include "platform/Uuid.h"
#include "platform/qt/EventThread.h"
#include "platform/qt/LineReader.h"
#include "platform/qt/PortsDirectory.h"
#include "platform/qt/QtEventLoop.h"
#include "platform/qt/QtFrameTransport.h"
#include "platform/qt/QtMainQueue.h"
#include "platform/qt/ResourceDirectory.h"
#include "platform/qt/SignalWatcher.h"
#include "platform/qt/StandardDescriptors.h"
#include "telephonyd/LogServer.h"
#include "telephonyd/phone/Scenarios.h"
#include "ui/output/JsonPane.h"
#include "ui/output/TextPane.h"

#include <cstdio>
#include <cstdlib>
#include <exception>
#include <filesystem>
#include <stdexcept>
#include <unistd.h>

using namespace orvane;

namespace
{

constexpr int kFailure = 1;
constexpr int kUnusableArguments = 2;

void complain(const std::string& text) { std::fprintf(stderr, "orvane: %s\n", text.c_str()); }

// The simulated phone's telephony server, on a thread of its own.
class SimulatedPhone
{
public:
    SimulatedPhone(std::string portsDirectory, std::string scenario)
        : _thread([directory = std::move(portsDirectory),
                   name = std::move(scenario)](MainQueue& queue) -> std::shared_ptr<void> {
              auto parts = std::make_shared<Parts>(directory, queue, name);
              if (const auto error = parts->server.start())
                  throw std::runtime_error(*error);
              return parts;
          })
    {
    }

private:
    struct Parts {
        Parts(const std::string& directory, MainQueue& queue, const std::string& scenario)
            : transport(directory), server(transport, queue, phoneSourceFactory(scenario, queue))
        {
        }
        QtFrameTransport transport;
        LogServer server;
    };

    EventThread _thread;
};

// Where a simulated phone's files are: kept from one run to the next, with the install marker and
// the log folder in it, so that saving works.
std::string demoRoot()
{
    const char* state = std::getenv("XDG_STATE_HOME");
    const char* home = std::getenv("HOME");
    std::filesystem::path root;
    if (state && state[0] == '/')
        root = state;
    else if (home && *home)
        root = std::filesystem::path(home) / ".local/state";
    else
        throw std::runtime_error("there is no home directory for the simulated phone's files: set "
                                 "HOME or XDG_STATE_HOME, or give --root DIR");
    root /= "orvane/demo";
    const FileSystem files(root.string());
    std::error_code error;
    for (const char* folder : {kInstallMarker, kLogFolder})
        if (!std::filesystem::create_directories(files.located(folder), error) && error)
            throw std::runtime_error("the simulated phone's files cannot be kept in " +
                                     root.string() + " (" + error.message() +
                                     "): set XDG_STATE_HOME, or give --root DIR");
    return root.string();
}

std::unique_ptr<OutputPane> makePane(const AppOptions& options, OutputPane::Write write)
{
    const bool isSimulated = options.demo.has_value();
    if (options.frontEnd == FrontEnd::Json)
        return std::make_unique<JsonPane>(std::move(write), isSimulated);
    return std::make_unique<TextPane>(std::move(write), isSimulated);
}

int exitStatus(const OutputDescriptor& output)
{
    if (output.state() != OutputDescriptor::State::Failed)
        return 0;
    complain(std::string("standard output cannot be written: ") + output.failure() +
             "; send it somewhere else");
    return kFailure;
}

// Shows the live view until it is ended.
int watch(const AppOptions& options, QtEventLoop& loop, const std::string& portsDirectory,
          const std::string& root)
{
    QtMainQueue queue;
    QtFrameTransport transport(portsDirectory);
    FramePorts ports(transport, queue);
    FrameTelephonyServer server(transport, ports, queue);
    const FileSystem files(root);

    OutputDescriptor output(STDOUT_FILENO);
    const auto pane = makePane(options, [&output, &loop](std::string_view text) {
        const auto state = output.write(text);
        // Interrupted: the signal's own callback ends the loop.
        if (state == OutputDescriptor::State::Closed || state == OutputDescriptor::State::Failed)
            loop.quit();
    });
    SinglePaneStack panes(*pane);
    OrvaneApp app({queue, ports, server, options.refreshInterval, makeUuid}, files, panes);

    CommandInterpreter commands(app, *pane, [&loop] { loop.quit(); });
    const LineReader lines(STDIN_FILENO, [&commands](std::string_view line, bool wasCut) {
        commands.takeLine(line, wasCut);
    });
    const SignalWatcher signals([&loop](int) { loop.quit(); });

    app.applicationDidFinishLaunching();
    loop.run();
    app.applicationWillTerminate();
    return exitStatus(output);
}

int run(const AppOptions& options)
{
    QtEventLoop loop;
    if (options.demo) {
        const PrivatePortsDirectory directory;
        const std::string root = options.root ? *options.root : demoRoot();
        const SimulatedPhone phone(directory.path(), *options.demo);
        return watch(options, loop, directory.path(), root);
    }
    std::string error;
    const auto directory = PortsDirectory::open(options.ports, error);
    if (!directory) {
        complain(error);
        return kFailure;
    }
    return watch(options, loop, directory->path(), options.root.value_or("/"));
}

} // namespace

int main(int argc, char** argv)
{
    prepareStandardDescriptors();
    const std::vector<std::string> arguments(argv + (argc > 0 ? 1 : 0), argv + argc);
    const std::vector<std::string> scenarios = scenarioNames();
    const AppOptions options = parseAppOptions(arguments, scenarios);
    if (options.error) {
        complain(*options.error);
        return kUnusableArguments;
    }
    if (options.wantsHelp) {
        std::fputs(appHelp(scenarios).c_str(), stdout);
        return 0;
    }
    if (options.wantsVersion) {
        std::puts("orvane " ORVANE_VERSION);
        return 0;
    }

    StandardErrorConsole console;
    DirectoryResources resources(resourceDirectory(ORVANE_SHARE, ORVANE_SOURCE_RESOURCES));
    Services& services = Services::current();
    services.setLog(options.log.get());
    services.setConsole(&console);
    services.setResources(&resources);
    services.setVersion(ORVANE_VERSION);
    int status = kFailure;
    try {
        status = run(options);
    } catch (const std::exception& failure) {
        complain(failure.what());
    }
    services.setLog(nullptr);
    services.setConsole(nullptr);
    services.setResources(nullptr);
    return status;
}
