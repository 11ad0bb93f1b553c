// Any messages on the cell-monitor channel.

#include "LogGenerator/GSM/GSMLogGenerator.h"

#include "GeneratorTarget.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    return orvane::playMessages<orvane::GSMLogGenerator>(data, size);
}
