#include "LogGenerator/C2K/C2KFormats.h"

#include <cmath>

namespace orvane
{

namespace
{

constexpr ValueName kBandClasses[] = {
    {0,  "800 MHz cellular band [0]"          },
    {1,  "1.8 to 2.0GHz PCS band [1]"         },
    {2,  "872 to 960MHz TACS band [2]"        },
    {3,  "832 to 925MHz JTACS band [3]"       },
    {4,  "1.75 to 1.87GHz Korean PCS band [4]"},
    {5,  "450MHz band [5]"                    },
    {6,  "2GHz band [6]"                      },
    {7,  "700MHz band [7]"                    },
    {8,  "1800 MHz band [8]"                  },
    {9,  "900 MHzband [9]"                    }, // without the blank: this is meant
    {10, "Secondary 800 MHz band [10]"        },
    {11, "400 MHz European PAMR band [11]"    },
    {12, "800 MHz European PAMR band [12]"    },
};

constexpr ValueName kEvdoDeviceStates[] = {
    {0, "Inactive [0]"   },
    {1, "Acquisition [1]"},
    {2, "Sync [2]"       },
    {3, "Idle [3]"       },
    {4, "Access [4]"     },
    {5, "Connected [5]"  },
};

constexpr ValueName kEvdoSessionStates[] = {
    {0, "Closed [0]"          },
    {1, "AMP setup [1]"       },
    {2, "AT-initiated neg [2]"},
    {3, "Initiated neg [3]"   },
    {4, "Open [4]"            },
};

constexpr ValueName kOneXDeviceStates[] = {
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

constexpr ValueName kRoamingIndicators[] = {
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

constexpr double kZeroDecibels = 512;

RowText nameOr(std::span<const ValueName> table, std::int64_t raw, std::string (*fallback)(int))
{
    const char* name = nameOf(table, raw, nullptr);
    return name ? std::string(name) : fallback(static_cast<int>(raw));
}

std::string badValue(int value) { return printed("[Bad Value %d]", value); }
std::string reserved(int value) { return printed("[Reserved %d]", value); }
std::string otherIndicator(int value) { return printed("ERI - %d", value); }

} // namespace

RowText bandClass(std::int64_t raw) { return nameOr(kBandClasses, raw, badValue); }

RowText evdoDeviceState(std::int64_t raw) { return nameOr(kEvdoDeviceStates, raw, reserved); }

RowText evdoSessionState(std::int64_t raw) { return nameOr(kEvdoSessionStates, raw, reserved); }

RowText oneXDeviceState(std::int64_t raw) { return nameOr(kOneXDeviceStates, raw, badValue); }

RowText roamingIndicator(std::int64_t raw)
{
    return nameOr(kRoamingIndicators, raw, otherIndicator);
}

RowText signedDecibelMilliwatts(std::int64_t raw)
{
    return printed("%+d dBm", static_cast<int>(raw));
}

std::string fineDecibelMilliwatts(double value) { return printed("%+.2f dBm", value); }

std::string fineDecibels(double value) { return printed("%+.2f dB", value); }

std::string decibelsOfEnergy(std::uint64_t energy)
{
    return fineDecibels(10 * std::log10(static_cast<double>(energy) / kZeroDecibels));
}

} // namespace orvane
