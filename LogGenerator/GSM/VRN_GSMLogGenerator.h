#pragma once

#include "LogGenerator/VRNLogGenerator2.h"

namespace orvane
{

// The generator for GSM/UMTS diagnostics: template "VRN_GSM", sections of VRN_GSMClassIndex.
class VRN_GSMLogGenerator final : public VRNLogGenerator2
{
public:
    ~VRN_GSMLogGenerator() override;
    void init();
    static std::unique_ptr<LogGenerator> generator();
};

} // namespace orvane
