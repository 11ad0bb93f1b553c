#pragma once

#include <string>

namespace orvane
{

// Shows one line about a recording on the console and, if there is one, on the screen.
void showRecordingNotice(const std::string& line);

} // namespace orvane
