#pragma once

#include <string_view>

namespace orvane
{

// Writes data to a file descriptor, usually standard output, and waits while its reader is behind.
// A signal that the program handles ends the wait and all writing: the program is about to end.
class OutputDescriptor
{
public:
    enum class State {
        Open,
        Closed,      // nobody reads any more
        Interrupted, // a signal came while waiting
        Failed,      // a full disk or another error, told by failure()
    };

    // Does not own the descriptor. Once not open, nothing more is written.
    explicit OutputDescriptor(int descriptor) : _descriptor(descriptor) {}

    State write(std::string_view data);
    [[nodiscard]] State state() const { return _state; }
    // What the system said, "" where nothing failed.
    [[nodiscard]] const char* failure() const;

private:
    int _descriptor;
    State _state = State::Open;
    int _error = 0;
};

} // namespace orvane
