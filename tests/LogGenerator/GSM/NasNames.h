#pragma once

#include <cstdint>
#include <map>
#include <string>

namespace orvane
{

// What the sections of the non-access stratum are to show, value by value; what a map lacks is
// "Unknown".
using ExpectedNames = std::map<std::uint32_t, const char*>;

inline std::string expectedName(const ExpectedNames& names, std::uint32_t value)
{
    const auto found = names.find(value);
    return found == names.end() ? "Unknown" : found->second;
}

inline const ExpectedNames kRegistrationStateNames = {
    {0, "REG_STATE_INACTIVE"        },
    {1, "REG_STATE_IDLE"            },
    {2, "REG_STATE_REGISTERING"     },
    {3, "REG_STATE_DEREGISTERING"   },
    {4, "REG_STATE_MANUAL_SEARCH"   },
    {5, "REG_STATE_AUTOMATIC_SEARCH"},
    {6, "REG_STATE_OFFLINE"         },
};

inline const ExpectedNames kMmStateNames = {
    {0,  "MM_NULL"                                       },
    {3,  "MM_LOCATION_UPDATE_INITIATED"                  },
    {5,  "MM_WAIT_FOR_OUTGOING_MM_CONNECTION"            },
    {6,  "MM_CONNECTION_ACTIVE"                          },
    {7,  "MM_IMSI_DETACH_INITIATED"                      },
    {8,  "MM_PROCESS_CM_SERVICE_PROMPT"                  },
    {9,  "MM_WAIT_FOR_NETWORK_COMMAND"                   },
    {10, "MM_LOCATION_UPDATE_REJECTED"                   },
    {13, "MM_WAIT_FOR_RR_CONNECTION_LU"                  },
    {14, "MM_WAIT_FOR_RR_CONNECTION_MM"                  },
    {15, "MM_WAIT_FOR_RR_CONNECTION_IMSI_DETACH"         },
    {17, "MM_REESTABLISHMENT_INITIATED"                  },
    {18, "MM_WAIT_FOR_RR_ACTIVE"                         },
    {19, "MM_IDLE"                                       },
    {20, "MM_WAIT_FOR_ADDITIONAL_OUTGOING_MM_ CONNECTION"},
    {21, "MM_WAIT_FOR_RR_CONNECTION_ REESTABLISHMENT"    },
    {22, "MM_WAIT_FOR_REESTABLISH_DECISION"              },
    {23, "MM_LOCATION_UPDATING_PENDING"                  },
    {25, "MM_RR_CONNECTION_RELEASE_NOT_ALLOWED"          },
};

} // namespace orvane
