#pragma once

#include <functional>
#include <memory>

namespace orvane
{

// Calls back from the thread's event loop whenever a file descriptor can be read or written without
// waiting, the other end's hang-up included. Does not own the descriptor, which must stay open
// while the watcher lives. The callback may destroy the watcher.
class DescriptorWatcher
{
public:
    enum class For { Reading, Writing };

    // Watches at once.
    DescriptorWatcher(int descriptor, For what, std::function<void()> callback);
    ~DescriptorWatcher();
    DescriptorWatcher(const DescriptorWatcher&) = delete;
    DescriptorWatcher& operator=(const DescriptorWatcher&) = delete;

    void setEnabled(bool enabled);

private:
    struct Notifier;
    std::unique_ptr<Notifier> _notifier;
};

} // namespace orvane
