#pragma once

#include "platform/base/TelephonyConstants.h"

#include <optional>
#include <string>
#include <string_view>

namespace orvane
{

// The radio technologies that a telephony server may serve: a name that people type, and the
// constant by which the server names it.
struct Technology {
    const char* name;
    const char* constant;
};

inline constexpr Technology kTechnologies[] = {
    {"lte",         kTSLogChannelTechnology_Varnel_LTE   },
    {"umts",        kTSLogChannelTechnology_Varnel_GSM   },
    {"utran",       kTSLogChannelTechnology_Varnel_UTRAN2},
    {"cdma",        kTSLogChannelTechnology_Varnel_CDMA  },
    {"cellmonitor", kTSLogChannelTechnology_IFX          },
};

// The constant for that name; nullopt for any other text.
std::optional<std::string> technologyNamed(std::string_view name);
// The name of that constant; empty for any other text.
std::string nameOfTechnology(std::string_view constant);
// All names, as a text for people: "lte, umts, ...".
std::string technologyNames();

} // namespace orvane
