#include "telephonyd/ModemSource.h"

#include "platform/base/Bytes.h"

#include <utility>

namespace orvane
{

void ModemSource::start(const LogSelection& selection, Send send)
{
    LogCodes codes;
    for (const std::uint32_t code : selection.modemCodes)
        codes.insert(static_cast<std::uint16_t>(code));
    // A modem cannot wait, so it is ignored whether the client is behind.
    _listener = _modem.listen(std::move(codes),
                              [send = std::move(send)](ByteView message) { send(message); });
}

} // namespace orvane
