#pragma once

#include "platform/base/PropertyValue.h"

#include <functional>
#include <string>

namespace orvane
{

// The service of this machine that knows its modems, asked over a bus. Nothing here waits. All
// operations belong to the thread of the event loop that serves it.
class ModemService
{
public:
    // The modems: a dictionary of object paths to interfaces to properties, whose values are
    // integers, booleans, reals, texts, arrays (structures too) and dictionaries. Where the service
    // cannot be asked `objects` is absent and `error` is the reason as a part of a sentence.
    using Answer = std::function<void(const PropertyValue& objects, const std::string& error)>;

    virtual ~ModemService() = default;
    // Calls `answer` once, never from within this call, and not after the service's end.
    virtual void ask(Answer answer) = 0;
    // Called whenever a modem has come, changed or gone, or the service itself; ask() tells what.
    virtual void setChangedCallback(std::function<void()> callback) = 0;
};

} // namespace orvane
