#pragma once

#include "app/AppOptions.h"
#include "platform/services/OutputDescriptor.h"
#include "screens/print/Printer.h"

#include <memory>

namespace orvane
{

class QtEventLoop;

// The exit status of a program that has written to this output. Prints what is wrong.
int exitStatusOf(const OutputDescriptor& output);

// Prints text or JSON on standard output and waits while the reader is behind. Ends the loop when
// nobody reads any more or nothing can be written.
class PrintedOutput
{
public:
    // The loop must outlive it.
    PrintedOutput(FrontEndKind kind, const AppOptions& options, QtEventLoop& loop);

    [[nodiscard]] Printer& printer() { return *_printer; }
    // The exit status of the program. Prints what is wrong.
    [[nodiscard]] int exitStatus() const { return exitStatusOf(_output); }

private:
    void print(std::string_view text);

    QtEventLoop& _loop;
    OutputDescriptor _output;
    std::unique_ptr<Printer> _printer;
};

} // namespace orvane
