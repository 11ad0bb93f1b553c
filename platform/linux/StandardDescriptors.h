#pragma once

namespace orvane
{

// What a program does first: opens /dev/null for each of standard input, output and error that it
// was started without, so that no file or socket of its own takes that number and is written or
// read by mistake; and ignores SIGPIPE and SIGXFSZ, so that a reader that leaves, or a file that
// may not grow further, is seen as an error of the write.
void prepareStandardDescriptors();

} // namespace orvane
