#include "app/CommandInterpreter.h"

#include "platform/base/Utf8.h"

#include <string>

namespace orvane
{

namespace
{

constexpr std::string_view kSave = "save";
constexpr std::string_view kQuit = "quit";

} // namespace

void CommandInterpreter::takeLine(std::string_view line, bool wasCut)
{
    if (line.ends_with('\r'))
        line.remove_suffix(1);
    if (line.empty())
        return;
    if (wasCut)
        _output.showError("the line is too long");
    else if (line == kQuit)
        _quit();
    else if (line == kSave)
        save("");
    else if (line.starts_with(kSave) && line[kSave.size()] == ' ')
        save(line.substr(kSave.size() + 1));
    else
        _output.showError("unknown command \"" + std::string(line) +
                          "\": the commands are save DESCRIPTION and quit");
}

void CommandInterpreter::save(std::string_view description)
{
    // What a file can hold: a description is typed, and may be anything.
    const auto result = _app.saveSnapshot(shownText(description));
    if (!result)
        _output.showError("saving is not offered on this machine");
    else if (result->isWritten)
        _output.showSaved(result->path);
    else
        _output.showAlert(kFileErrorTitle, kFileErrorMessage);
}

} // namespace orvane
