#pragma once

#include "platform/base/Bytes.h"
#include "telephonyd/modem/DiagnosticModem.h"
#include "telephonyd/phone/LogSource.h"

#include <memory>
#include <string>

namespace orvane
{

// Sends what a real modem logs. The start command's modem codes are asked of the modem as long as
// the source lives.
class ModemSource final : public LogSource
{
public:
    // The modem is not owned and must outlive the source.
    explicit ModemSource(DiagnosticModem& modem) : _modem(modem) {}

    // Empty while the modem's technology is not known; asking has it found out.
    [[nodiscard]] std::string technology() const override { return _modem.technology(); }
    void start(const LogSelection& selection, Send send) override;

private:
    DiagnosticModem& _modem;
    std::unique_ptr<DiagnosticModem::Listener> _listener;
};

} // namespace orvane
