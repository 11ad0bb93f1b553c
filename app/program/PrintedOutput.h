#pragma once

#include "app/AppOptions.h"
#include "platform/services/OutputDescriptor.h"
#include "screens/print/Printer.h"

#include <memory>

namespace orvane
{

class QtEventLoop;

// What a program ends with that has written to this output; tells what is wrong.
int exitStatusOf(const OutputDescriptor& output);

// Standard output, printed on as text or JSON, waiting while its reader is behind. Where nobody
// reads any more, or nothing can be written, the loop ends.
class PrintedOutput
{
public:
    // The loop is referred to and must outlive it.
    PrintedOutput(FrontEndKind kind, const AppOptions& options, QtEventLoop& loop);

    [[nodiscard]] Printer& printer() { return *_printer; }
    // What the program ends with; tells what is wrong.
    [[nodiscard]] int exitStatus() const { return exitStatusOf(_output); }

private:
    void print(std::string_view text);

    QtEventLoop& _loop;
    OutputDescriptor _output;
    std::unique_ptr<Printer> _printer;
};

} // namespace orvane
