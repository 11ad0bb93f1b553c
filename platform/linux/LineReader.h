#pragma once

#include <cstddef>
#include <functional>
#include <memory>
#include <string_view>

namespace orvane
{

// Reads lines from a file descriptor (pipe, terminal, file, /dev/null) through the thread's event
// loop. Does not own the descriptor. Does not change its mode, which other processes may share.
class LineReader
{
public:
    // Longer lines are cut here; the rest of the line is skipped.
    static constexpr std::size_t kLineLimit = std::size_t{64} * 1024;

    // Gets a line without its newline; the last line may lack one. `wasCut`: the line was longer.
    // Either callback may destroy the reader.
    using LineCallback = std::function<void(std::string_view line, bool wasCut)>;
    // Called once, after the last line, also where the descriptor cannot be read.
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
