#pragma once

#include "telephonyd/phone/Scenario.h"

#include <map>

namespace orvane
{

// Messages of procedures that take time, kept until they are due.
class Agenda
{
public:
    void add(std::chrono::milliseconds at, PhoneMessage message)
    {
        _messages.emplace(at, std::move(message));
    }
    void clear() { _messages.clear(); }
    // Moves the messages that are due at `now` to the end of `messages`, ordered by time and then
    // by when they were added.
    void takeDue(std::chrono::milliseconds now, std::vector<PhoneMessage>& messages)
    {
        const auto end = _messages.upper_bound(now);
        for (auto each = _messages.begin(); each != end; ++each)
            messages.push_back(std::move(each->second));
        _messages.erase(_messages.begin(), end);
    }

private:
    std::multimap<std::chrono::milliseconds, PhoneMessage> _messages;
};

} // namespace orvane
