#pragma once

#include <cstddef>
#include <functional>
#include <memory>
#include <string_view>

namespace orvane
{

// Reads lines from a file descriptor (pipe, terminal, file, /dev/null) through the thread's event
// loop. Neither owns the descriptor nor changes its mode, which it may share with other processes.
class LineReader
{
public:
    // Longer lines are cut here; the rest of the line is skipped.
    static constexpr std::size_t kLineLimit = std::size_t{64} * 1024;

    // A line without its newline; a last line need not have one. `wasCut`: it was longer.
    // Either callback may destroy the reader.
    using LineCallback = std::function<void(std::string_view line, bool wasCut)>;
    // Called once, after the last line. A descriptor that cannot be read is at its end.
    using EndCallback = std::function<void()>;

    // Neither callback comes from within the constructor.
    LineReader(int descriptor, LineCallback lineCallback, EndCallback endCallback = {});
    ~LineReader();
    LineReader(const LineReader&) = delete;
    LineReader& operator=(const LineReader&) = delete;

private:
    struct State;
    std::shared_ptr<State> _state;
};

} // namespace orvane
