#pragma once

#include "platform/base/Bytes.h"

#include <optional>

namespace orvane
{

// The version report with which the DLF files of this program begin: of its version, the clock's
// time and the local time zone. Nothing, with an error line, where it cannot be made.
std::optional<Bytes> makeVersionReport();

} // namespace orvane
