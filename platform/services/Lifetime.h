#pragma once

#include <memory>
#include <utility>

namespace orvane
{

// Ends with the object that it is a member of. Tasks that refer to that object and may run later
// (from a queue, from a timer) are wrapped by whileAlive(), so that they do nothing once it is
// gone. Only for owners whose tasks run on the thread that destroys them.
class Lifetime
{
public:
    Lifetime() = default;
    Lifetime(const Lifetime&) = delete;
    Lifetime& operator=(const Lifetime&) = delete;

    // The task, which then runs only while the owner lives. It may destroy the owner.
    template <typename Task>
    [[nodiscard]] auto whileAlive(Task task) const
    {
        return [token = std::weak_ptr(_token), task = std::move(task)] {
            if (!token.expired())
                task();
        };
    }

private:
    std::shared_ptr<const bool> _token = std::make_shared<const bool>(true);
};

} // namespace orvane
