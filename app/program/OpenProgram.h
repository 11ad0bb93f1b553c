#pragma once

#include "app/program/FrontEnd.h"

#include <memory>

namespace orvane
{

// `orvane open FILE` in the front ends that print: the whole recording, once. Returns the exit
// status. The options are those of a recording.
int printRecording(const AppOptions& options, FrontEndKind kind, QtEventLoop& loop);

// The same in the window and the terminal, until the user leaves.
int browseRecording(const AppOptions& options, std::unique_ptr<FrontEnd> frontEnd,
                    QtEventLoop& loop);

} // namespace orvane
