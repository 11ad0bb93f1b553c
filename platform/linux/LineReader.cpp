#include "platform/linux/LineReader.h"

#include "platform/linux/DescriptorWatcher.h"
#include "platform/linux/QtMainQueue.h"

#include <algorithm>
#include <array>
#include <cerrno>
#include <fcntl.h>
#include <string>
#include <unistd.h>

namespace orvane
{

struct LineReader::State {
    int descriptor = -1;
    LineCallback lineCallback;
    EndCallback endCallback;
    QtMainQueue queue;
    std::unique_ptr<DescriptorWatcher> watcher;
    std::string line;
    bool isCut = false;
    bool isStopped = false;

    void add(std::string_view text)
    {
        const std::size_t taken = std::min(text.size(), kLineLimit - line.size());
        line.append(text.substr(0, taken));
        isCut = isCut || taken < text.size();
    }

    void deliverLine()
    {
        const std::string delivered = std::move(line);
        const bool wasCut = isCut;
        line.clear();
        isCut = false;
        if (lineCallback)
            lineCallback(delivered, wasCut);
    }

    void take(std::string_view text)
    {
        while (!isStopped && !text.empty()) {
            const std::size_t newline = text.find('\n');
            add(text.substr(0, newline));
            if (newline == std::string_view::npos)
                return;
            text.remove_prefix(newline + 1);
            deliverLine();
        }
    }

    void end()
    {
        watcher.reset();
        if (!line.empty())
            deliverLine();
        if (!isStopped && endCallback)
            endCallback();
    }

    void readSome()
    {
        std::array<char, 4096> block{};
        const auto count = ::read(descriptor, block.data(), block.size());
        if (count > 0)
            take({block.data(), static_cast<std::size_t>(count)});
        else if (count == 0 || (errno != EINTR && errno != EAGAIN))
            end();
    }
};

LineReader::LineReader(int descriptor, LineCallback lineCallback, EndCallback endCallback)
    : _state(std::make_shared<State>())
{
    _state->descriptor = descriptor;
    _state->lineCallback = std::move(lineCallback);
    _state->endCallback = std::move(endCallback);
    // Calls from the loop hold the state while they run: a callback may destroy the reader.
    const std::weak_ptr weak(_state);
    if (::fcntl(descriptor, F_GETFD) < 0) {
        _state->queue.async([weak] {
            if (const auto state = weak.lock())
                state->end();
        });
        return;
    }
    _state->watcher =
        std::make_unique<DescriptorWatcher>(descriptor, DescriptorWatcher::For::Reading, [weak] {
            if (const auto state = weak.lock())
                state->readSome();
        });
}

LineReader::~LineReader()
{
    _state->isStopped = true;
    _state->watcher.reset();
}

} // namespace orvane
