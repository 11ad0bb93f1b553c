// Any messages on a GSM/UMTS channel.

#include "LogGenerator/GSM/VRN_GSMLogGenerator.h"

#include "GeneratorTarget.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    return orvane::playMessages<orvane::VRN_GSMLogGenerator>(data, size);
}
