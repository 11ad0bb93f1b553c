// Any messages on an LTE channel.

#include "LogGenerator/LTE/LTELogGenerator.h"

#include "GeneratorTarget.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    return orvane::playMessages<orvane::LTELogGenerator>(data, size);
}
