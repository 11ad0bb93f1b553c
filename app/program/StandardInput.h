#pragma once

#include <string>

namespace orvane
{

// Reads standard input to its end into a file without a name, and returns a path at which this
// process can open the file. Afterwards standard input is the terminal of the process, or empty
// without one. Throws std::runtime_error with a line for the user if the file cannot be written.
std::string keepStandardInput();

// Makes standard input empty: there are no commands to read from it.
void closeStandardInput();

} // namespace orvane
