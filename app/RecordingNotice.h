#pragma once

#include <string>

namespace orvane
{

// Tells the user one line about a recording, on the console and, where there is one, on the screen.
void showRecordingNotice(const std::string& line);

} // namespace orvane
