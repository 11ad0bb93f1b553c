#pragma once

#include "platform/services/ModemService.h"

#include <memory>

namespace orvane
{

// ModemManager on the system bus or, for tests, on the session bus; on the event loop of the thread
// that makes it.
class ModemManagerClient final : public ModemService
{
public:
    enum class Bus { System, Session };

    explicit ModemManagerClient(Bus bus);
    ~ModemManagerClient() override;
    ModemManagerClient(const ModemManagerClient&) = delete;
    ModemManagerClient& operator=(const ModemManagerClient&) = delete;

    void ask(Answer answer) override;
    void setChangedCallback(std::function<void()> callback) override;

private:
    class Connection;
    std::unique_ptr<Connection> _connection;
};

} // namespace orvane
