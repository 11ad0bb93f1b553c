#include "app/program/ExportProgram.h"

#include "app/program/FrontEnd.h"
#include "app/program/PrintedOutput.h"
#include "app/program/TerminalProgress.h"
#include "recordings/CsvRowWriter.h"
#include "recordings/JsonRowWriter.h"
#include "recordings/PathListWriter.h"
#include "recordings/RecordingExport.h"

#include <csignal>
#include <unistd.h>

namespace orvane
{

namespace
{

volatile std::sig_atomic_t isProgressShown = 0;

// SIGINT and SIGTERM end the export at once, whatever it is doing: reading a large file, decoding,
// or waiting for the reader of its output. Nothing has to be cleaned up: rows that are put aside on
// disk are in a file without a name.
void endOnSignals()
{
    struct sigaction action = {};
    action.sa_handler = [](int) {
        if (isProgressShown) [[maybe_unused]]
            const ssize_t ignored = ::write(STDERR_FILENO, "\n", 1);
        ::_exit(0);
    };
    for (const int signal : {SIGINT, SIGTERM})
        sigaction(signal, &action, nullptr);
}

// Writes to standard output in large pieces.
class Output
{
public:
    // False if nobody reads on, or nothing can be written.
    bool write(std::string_view lines)
    {
        _pending += lines;
        return _pending.size() < kPiece || flush();
    }
    bool flush()
    {
        const auto state = _descriptor.write(_pending);
        _pending.clear();
        return state == OutputDescriptor::State::Open;
    }
    // Returns the exit status. Prints what is wrong.
    [[nodiscard]] int end()
    {
        flush();
        return exitStatusOf(_descriptor);
    }

private:
    static constexpr std::size_t kPiece = 65536;

    OutputDescriptor _descriptor{STDOUT_FILENO};
    std::string _pending;
};

std::unique_ptr<RowWriter> makeWriter(const AppOptions& options, RowWriter::Output output)
{
    using Cells = CsvRowWriter::Cells;
    switch (options.format) {
    case ExportFormat::Csv:
        return std::make_unique<CsvRowWriter>(
            std::move(output), options.isForSpreadsheet ? Cells::ForSpreadsheet : Cells::Exact);
    case ExportFormat::PathList:
        return std::make_unique<PathListWriter>(std::move(output));
    case ExportFormat::JsonLines:
        break;
    }
    return std::make_unique<JsonRowWriter>(std::move(output));
}

// Returns the exit status.
int exportRecording(const AppOptions& options)
{
    Output output;
    const auto writer =
        makeWriter(options, [&output](std::string_view lines) { return output.write(lines); });
    auto progress = progressOnTerminal("Reading " + options.file);
    ExportRequest request{options.file, options.technology, options.refreshInterval, options.paths};
    RecordingExport recordingExport(std::move(request), *writer, [&progress](double done) {
        if (progress)
            progress->show(done);
    });
    isProgressShown = progress != nullptr;
    const auto problem = recordingExport.run();
    isProgressShown = 0;
    progress.reset();
    if (problem)
        complain(*problem);
    for (const std::string& remark : recordingExport.remarks())
        complain(remark);
    const int status = output.end();
    return problem ? kFailure : status;
}

} // namespace

int runExport(const AppOptions& options)
{
    endOnSignals();
    return exportRecording(options);
}

} // namespace orvane
