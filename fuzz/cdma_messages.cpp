// Any messages on a CDMA channel.

#include "LogGenerator/C2K/C2KLogGenerator.h"

#include "GeneratorTarget.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    return orvane::playMessages<orvane::C2KLogGenerator>(data, size);
}
