#include "app/RecordingNotice.h"

#include "platform/services/Console.h"
#include "screens/toolkit/Screen.h"

#include <memory>

namespace orvane
{

void showRecordingNotice(const std::string& line)
{
    consoleLine("%s", line.c_str());
    Screen::main().showAlert(std::make_unique<AlertView>("Recording", line, "Close"));
}

} // namespace orvane
