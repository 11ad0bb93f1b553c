// Any messages on a UTRAN channel.

#include "LogGenerator/UTRAN/UTRANLogGenerator.h"

#include "GeneratorTarget.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    return orvane::playMessages<orvane::UTRANLogGenerator>(data, size);
}
