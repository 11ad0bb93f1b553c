#pragma once

#include <chrono>
#include <functional>

namespace orvane
{

// Runs the task in a thread of its own and waits for its end, for at most that time. Returns
// whether it has ended. One that has not is abandoned: it may go on for ever, and must use nothing
// but what it owns. What the task throws is dropped; where there can be no thread, it is not run.
bool runWithin(std::chrono::milliseconds time, std::function<void()> task);

// The last call of main(): returns the status. Where a task was abandoned, it ends the process at
// once, after all output is written, since what an ordinary end destroys may wait for the task.
[[nodiscard]] int exitStatusAfterTasks(int status);

} // namespace orvane
