#include "app/program/OpenProgram.h"

#include "app/RecordingApp.h"
#include "app/program/PrintedOutput.h"
#include "app/program/TerminalProgress.h"
#include "platform/linux/LineReader.h"
#include "platform/linux/QtEventLoop.h"
#include "platform/linux/QtMainQueue.h"
#include "platform/linux/SignalWatcher.h"
#include "screens/print/RecordingPrinter.h"

#include <chrono>
#include <stdexcept>
#include <unistd.h>

namespace orvane
{

namespace
{

OpenedRecording opened(const AppOptions& options)
{
    OpenedRecording recording = openRecording(options.file);
    if (recording.error)
        throw std::runtime_error(*recording.error);
    return recording;
}

RecordingSettings settingsOf(const AppOptions& options)
{
    return {options.file, options.technology, options.refreshInterval};
}

// Takes a command of a front end that prints. There is nothing to save.
void takeLine(std::string_view line, Printer& output, QtEventLoop& loop)
{
    if (line.ends_with('\r'))
        line.remove_suffix(1);
    if (line == "quit")
        loop.quit();
    else if (!line.empty())
        output.showError("the only command while a recording is printed is quit");
}

} // namespace

int printRecording(const AppOptions& options, FrontEndKind kind, QtEventLoop& loop)
{
    QtMainQueue queue;
    PrintedOutput output(kind, options, loop);
    auto progress = progressOnTerminal("Reading " + options.file);
    std::unique_ptr<RecordingPrinter> printer;
    printer = std::make_unique<RecordingPrinter>(queue, opened(options), settingsOf(options),
                                                 output.printer(), [&] {
                                                     if (progress)
                                                         progress->show(printer->progress());
                                                     if (printer->hasEnded())
                                                         loop.quit();
                                                 });
    const LineReader lines(
        STDIN_FILENO, [&](std::string_view line, bool) { takeLine(line, output.printer(), loop); });
    const SignalWatcher signals([&loop](int) { loop.quit(); }, {SIGINT, SIGTERM, SIGHUP},
                                SignalWatcher::Second::EndsProgram);
    loop.run();
    progress.reset();
    if (printer->failure()) {
        complain(*printer->failure());
        return kFailure;
    }
    if (const std::string remark = printer->remark(); printer->hasEnded() && !remark.empty())
        complain(options.file + ": " + remark);
    return output.exitStatus();
}

int browseRecording(const AppOptions& options, std::unique_ptr<FrontEnd> frontEnd,
                    QtEventLoop& loop)
{
    QtMainQueue queue;
    const FileSystem files;
    std::optional<std::string> failure;
    const auto fail = [&](const std::string& text) {
        failure = text;
        loop.quit();
    };
    const auto now = [] {
        return std::chrono::nanoseconds(std::chrono::steady_clock::now().time_since_epoch());
    };
    RecordingApp app({queue, now, files, fail}, opened(options), settingsOf(options));
    const SignalWatcher signals([&loop](int) { loop.quit(); }, {SIGINT, SIGTERM, SIGHUP},
                                SignalWatcher::Second::EndsProgram);
    app.applicationDidFinishLaunching();
    loop.run();
    app.applicationWillTerminate();
    const int status = frontEnd->exitStatus();
    // The terminal's screen must be gone before anything is printed.
    frontEnd.reset();
    if (failure)
        complain(*failure);
    return failure ? kFailure : status;
}

} // namespace orvane
