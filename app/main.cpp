#include "app/AppOptions.h"
#include "app/OrvaneApp.h"
#include "app/RecordingNotice.h"
#include "app/SavingRoot.h"
#include "app/program/Display.h"
#include "app/program/ExportProgram.h"
#include "app/program/FrontEnd.h"
#include "app/program/OpenProgram.h"
#include "app/program/ProgramServices.h"
#include "app/program/SimulatedPhone.h"
#include "app/program/StandardInput.h"
#include "app/program/TerminalFrontEnd.h"
#include "app/program/WindowFrontEnd.h"
#include "platform/linux/BoundedCall.h"
#include "platform/linux/PortsDirectory.h"
#include "platform/linux/PrivatePortsDirectory.h"
#include "platform/linux/QtEventLoop.h"
#include "platform/linux/QtMainQueue.h"
#include "platform/linux/QtPreferencesStore.h"
#include "platform/linux/ServerSearch.h"
#include "platform/linux/SignalWatcher.h"
#include "platform/linux/SocketTransport.h"
#include "platform/linux/StalePorts.h"
#include "platform/linux/StandardDescriptors.h"
#include "platform/ports/MessagePorts.h"
#include "platform/ports/TelephonyServer.h"
#include "platform/services/Complaint.h"
#include "platform/services/Uuid.h"
#include "recordings/LogRecorder.h"
#include "screens/terminal/TerminalKind.h"
#include "screens/window/QtWindowApplication.h"
#include "telephonyd/phone/Scenarios.h"

#include <cstdio>
#include <ctime>
#include <exception>
#include <new>
#include <optional>
#include <stdexcept>
#include <unistd.h>

using namespace orvane;

namespace
{

std::unique_ptr<FrontEnd> makeFrontEnd(FrontEndKind kind, const AppOptions& options,
                                       QtEventLoop& loop)
{
    switch (kind) {
    case FrontEndKind::Terminal:
        return makeTerminalFrontEnd(options, loop);
    case FrontEndKind::Window:
        return makeWindowFrontEnd(options, loop);
    case FrontEndKind::Text:
    case FrontEndKind::Json:
        break;
    }
    return makeOutputFrontEnd(kind, options, loop);
}

// Null where nothing is to be recorded.
std::unique_ptr<LogRecorder> makeRecorder(const AppOptions& options, MainQueue& queue)
{
    if (!options.record)
        return nullptr;
    using Existing = DiskBlockFile::Existing;
    const auto existing = options.overwritesRecord ? Existing::Overwritten : Existing::Refused;
    std::string error;
    auto recorder =
        LogRecorder::create(queue, *options.record, existing, showRecordingNotice, error);
    if (!recorder)
        throw std::runtime_error(error);
    return recorder;
}

// Shows the live view until it is ended.
int watch(const AppOptions& options, FrontEndKind kind, QtEventLoop& loop,
          FrameTransport& transport, const std::string& root)
{
    QtMainQueue queue;
    MessagePorts ports(transport, queue);
    TelephonyServer server(transport, ports, queue);
    const FileSystem files(root);
    QtPreferencesStore preferences;

    const std::unique_ptr<LogRecorder> recorder = makeRecorder(options, queue);
    const std::unique_ptr<FrontEnd> frontEnd = makeFrontEnd(kind, options, loop);
    const std::unique_ptr<LiveApp> app =
        frontEnd->makeApp({queue, ports, server, options.refreshInterval, makeUuid, recorder.get()},
                          files, preferences);
    const SignalWatcher signals([&loop](int) { loop.quit(); }, {SIGINT, SIGTERM, SIGHUP},
                                SignalWatcher::Second::EndsProgram);

    frontEnd->begin(*app);
    app->applicationDidFinishLaunching();
    loop.run();
    frontEnd->end();
    app->applicationWillTerminate();
    return frontEnd->exitStatus();
}

std::unique_ptr<FrameTransport> viewerTransport(const PortsDirectory& directory,
                                                const AppOptions& options)
{
    if (PortsDirectory::isNamed(options.ports))
        return std::make_unique<SocketTransport>(directory);
    return std::make_unique<ServerSearch>(directory, PortsDirectory::kSystemPath,
                                          PortsDirectory::systemSharedOwner());
}

int run(const AppOptions& options, FrontEndKind kind)
{
    // The event loop of a program with a window needs a larger kind of application object.
    std::optional<QtWindowApplication> windowApplication;
    if (kind == FrontEndKind::Window)
        windowApplication.emplace();
    QtEventLoop loop;
    if (options.command == AppCommand::Open)
        return kind == FrontEndKind::Text || kind == FrontEndKind::Json
                   ? printRecording(options, kind, loop)
                   : browseRecording(options, makeFrontEnd(kind, options, loop), loop);
    PrivatePortsDirectory::removeAbandoned(std::time(nullptr));
    if (options.demo) {
        const PrivatePortsDirectory directory;
        const std::string root = options.root ? *options.root : simulatedPhoneRoot();
        const SimulatedPhone phone(directory.directory(), *options.demo);
        SocketTransport transport(directory.directory());
        return watch(options, kind, loop, transport, root);
    }
    std::string error;
    const auto directory = PortsDirectory::open(options.ports, error);
    if (!directory) {
        complain(error);
        return kFailure;
    }
    removeStalePorts(*directory, StalePorts::Clients, std::time(nullptr));
    const auto transport = viewerTransport(*directory, options);
    return watch(options, kind, loop, *transport, options.root ? *options.root : liveRoot());
}

} // namespace

void orvane::complain(const std::string& text) { printComplaint("orvane", text); }

int main(int argc, char** argv)
{
    prepareStandardDescriptors();
    const std::vector<std::string> arguments(argv + (argc > 0 ? 1 : 0), argv + argc);
    const std::vector<std::string> scenarios = scenarioNames();
    AppOptions options = parseAppOptions(arguments, scenarios);
    if (options.error) {
        complain(*options.error);
        return kUnusableArguments;
    }
    if (options.wantsHelp) {
        std::fputs(appHelp(options.command, scenarios).c_str(), stdout);
        return 0;
    }
    if (options.wantsVersion) {
        std::puts("orvane " ORVANE_VERSION);
        return 0;
    }

    const bool isExport = options.command == AppCommand::Export;
    const bool readsStandardInput = options.file == "-";
    if (readsStandardInput) {
        try {
            options.file = keepStandardInput();
        } catch (const std::exception& failure) {
            complain(failure.what());
            return kFailure;
        }
    }
    const FrontEndKind kind =
        isExport ? FrontEndKind::Text
                 : options.frontEnd.value_or(defaultFrontEnd(hasDisplay(), !terminalProblem()));
    if (readsStandardInput && (kind == FrontEndKind::Text || kind == FrontEndKind::Json))
        closeStandardInput();
    const auto log = makeLog(options.log, "orvane");
    // Standard output carries data, or the terminal's screen, unless there is a window.
    const ProgramServices services(log.get(), kind == FrontEndKind::Window ? stdout : stderr);
    if (const auto& problem = services.problem()) {
        complain(*problem);
        // Snapshots are shown without templates.
        if (options.command == AppCommand::Live)
            return kFailure;
    }
    int status = kFailure;
    try {
        status = isExport ? runExport(options) : run(options, kind);
    } catch (const std::bad_alloc&) {
        complain(options.file.empty() ? "there is not enough memory"
                                      : "there is not enough memory for \"" + options.file +
                                            "\": name a smaller file, or end other programs");
    } catch (const std::exception& failure) {
        complain(failure.what());
    }
    return exitStatusAfterTasks(status);
}
