#pragma once

#include "LogGenerator/Formats.h"

namespace orvane
{

// Tables and formats of the CDMA decoders.

inline constexpr ValueName kBandClasses[] = {
    {0,  "800 MHz cellular band [0]"          },
    {1,  "1.8 to 2.0GHz PCS band [1]"         },
    {2,  "872 to 960MHz TACS band [2]"        },
    {3,  "832 to 925MHz JTACS band [3]"       },
    {4,  "1.75 to 1.87GHz Korean PCS band [4]"},
    {5,  "450MHz band [5]"                    },
    {6,  "2GHz band [6]"                      },
    {7,  "700MHz band [7]"                    },
    {8,  "1800 MHz band [8]"                  },
    {9,  "900 MHzband [9]"                    }, // deliberate: without the blank
    {10, "Secondary 800 MHz band [10]"        },
    {11, "400 MHz European PAMR band [11]"    },
    {12, "800 MHz European PAMR band [12]"    },
};

inline constexpr ValueName kEvdoDeviceStates[] = {
    {0, "Inactive [0]"   },
    {1, "Acquisition [1]"},
    {2, "Sync [2]"       },
    {3, "Idle [3]"       },
    {4, "Access [4]"     },
    {5, "Connected [5]"  },
};

inline constexpr ValueName kEvdoSessionStates[] = {
    {0, "Closed [0]"          },
    {1, "AMP setup [1]"       },
    {2, "AT-initiated neg [2]"},
    {3, "Initiated neg [3]"   },
    {4, "Open [4]"            },
};

inline constexpr ValueName kOneXDeviceStates[] = {
    {0,  "Inactive [0]"                        },
    {1,  "Deep sleep in start state [1]"       },
    {2,  "Initial state for CDMA operation [2]"},
    {3,  "Acquisition [3]"                     },
    {4,  "Sync [4]"                            },
    {5,  "Slew [5]"                            },
    {6,  "Paging [6]"                          },
    {7,  "Slotted mode sleep state [7]"        },
    {8,  "Traffic [8]"                         },
    {9,  "UnSlew [9]"                          },
    {10, "Operation in PCG state [10]"         },
    {11, "Powerup state [11]"                  },
};

inline constexpr ValueName kRoamingIndicators[] = {
    {0,  "OFF [0]"                           },
    {1,  "ON [1]"                            },
    {2,  "Flashing [2]"                      },
    {3,  "Out of Neighborhood [3]"           },
    {4,  "Out of Building [4]"               },
    {5,  "Preferred system [5]"              },
    {6,  "Available system [6]"              },
    {7,  "Alliance partner [7]"              },
    {8,  "Premium partner [8]"               },
    {9,  "Full service functionality [9]"    },
    {10, "Partial service functionality [10]"},
    {11, "Banner ON [11]"                    },
    {12, "Banner OFF [12]"                   },
};

// What shows for values that a table lacks: "[Bad Value %d]", "[Reserved %d]", "ERI - %d".
std::string badValue(std::int64_t raw);
std::string reserved(std::int64_t raw);
std::string otherIndicator(std::int64_t raw);

inline constexpr Format bandClass = namesFormat(kBandClasses, nullptr).withFallback(badValue);
inline constexpr Format evdoDeviceState =
    namesFormat(kEvdoDeviceStates, nullptr).withFallback(reserved);
inline constexpr Format evdoSessionState =
    namesFormat(kEvdoSessionStates, nullptr).withFallback(reserved);
inline constexpr Format oneXDeviceState =
    namesFormat(kOneXDeviceStates, nullptr).withFallback(badValue);
// A signed value.
inline constexpr Format roamingIndicator =
    namesFormat(kRoamingIndicators, nullptr).withFallback(otherIndicator);

// "%+d dBm".
inline constexpr Format signedDecibelMilliwatts = wholeFormat(" dBm").withPlus();
// "%+.2f dB" of an energy in which 512 is 0 dB; none at all is minus infinity.
double decibelsOfEnergy(std::int64_t energy);
inline constexpr Format energyLevel =
    fixedFormat({}, 2, " dB").withPlus().withValue(decibelsOfEnergy);

} // namespace orvane
