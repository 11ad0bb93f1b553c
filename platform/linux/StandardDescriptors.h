#pragma once

namespace orvane
{

// The first call of a program. Opens /dev/null for each of standard input, output and error that is
// not open: otherwise a file or socket of the program could get that number and be read or written
// by mistake. Ignores SIGPIPE and SIGXFSZ, so that a closed pipe and the limit of a file's size are
// errors of the write.
void prepareStandardDescriptors();

} // namespace orvane
