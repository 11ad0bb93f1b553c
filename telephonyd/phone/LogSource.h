#pragma once

#include "platform/base/Bytes.h"

#include <cstdint>
#include <functional>
#include <memory>
#include <set>
#include <string>

namespace orvane
{

// What a start command asked a log channel for. Modem codes are 16-bit log codes; extra codes are
// the numbers of the items that the server makes itself (0 SIM files, 1 cells, 2 data connections).
// A start command without log codes (the cell-monitor channel) leaves both empty.
struct LogSelection {
    std::set<std::uint32_t> modemCodes;
    std::set<std::uint32_t> extraCodes;
};

// The source of the messages of one log channel: a simulated phone, a recording or a modem. Each
// channel gets a new one, in the thread of the server's queue.
class LogSource
{
public:
    // Takes one log message in its wire format. Returns whether the client can take more now. If
    // not, a source that can wait stops until resume(). One that cannot, such as a live phone,
    // continues, and the channel ends if too much is unread.
    using Send = std::function<bool(ByteView message)>;

    virtual ~LogSource() = default;
    // The technology constant that answers the technology query. Empty while it is not known: the
    // query then gets an empty reply, and the client asks again.
    [[nodiscard]] virtual std::string technology() const = 0;
    // Begins to send what the selection asks for, never from within this call. Called once.
    virtual void start(const LogSelection& selection, Send send) = 0;
    // The client has taken what was queued.
    virtual void resume() {}
};

// Makes the source of a new channel.
using LogSourceFactory = std::function<std::unique_ptr<LogSource>()>;

} // namespace orvane
