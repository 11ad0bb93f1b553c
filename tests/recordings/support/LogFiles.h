#pragma once

#include "LogGenerator/LogTechnology.h"
#include "platform/base/TelephonyConstants.h"
#include "platform/services/FileSystem.h"
#include "support/Paths.h"

#include <cstdint>
#include <memory>
#include <string>
#include <vector>

namespace orvane
{

// A recording of the tests' data and its technology.
struct RecordedDrive {
    const char* file;
    const char* technology;
};

inline constexpr RecordedDrive kDrives[] = {
    {"lte-drive.dlf",         kTSLogChannelTechnology_Varnel_LTE   },
    {"lte-drive-damaged.dlf", kTSLogChannelTechnology_Varnel_LTE   },
    {"umts-city.dlf",         kTSLogChannelTechnology_Varnel_GSM   },
    {"utran-walk.dlf",        kTSLogChannelTechnology_Varnel_UTRAN2},
    {"cdma-evening.dlf",      kTSLogChannelTechnology_Varnel_CDMA  },
};

inline Bytes recordedFile(const std::string& name)
{
    return readFile(testDataPath(name)).value_or(Bytes());
}

// A log in memory that owns its bytes.
inline std::shared_ptr<ByteSource> sourceOf(Bytes bytes)
{
    struct Owner {
        explicit Owner(Bytes content) : bytes(std::move(content)), source(bytes) {}
        Bytes bytes;
        MemorySource source;
    };
    const auto owner = std::make_shared<Owner>(std::move(bytes));
    return {owner, &owner->source};
}

inline std::shared_ptr<ByteSource> recordedLog(const std::string& name)
{
    return sourceOf(recordedFile(name));
}

// Steps of 1.25 ms as a timestamp; one second of a recording that begins in 2017.
constexpr std::uint64_t kLogStep = std::uint64_t{1} << 16;
constexpr std::uint64_t kLogSecond = 800 * kLogStep;
constexpr std::uint64_t kLogStart = 1183782848 * kLogSecond;

// Puts a log together, item by item.
class LogBuilder
{
public:
    LogBuilder& item(std::uint16_t code, std::uint64_t timestamp, const Bytes& payload)
    {
        put(payload.size() + 12, 2);
        put(code, 2);
        put(timestamp, 8);
        bytes.insert(bytes.end(), payload.begin(), payload.end());
        return *this;
    }
    // An LTE measurement whose first row, "Serving Cell Measurements/E-ARFCN", shows the number.
    LogBuilder& measurement(std::uint64_t timestamp, std::uint16_t channel)
    {
        Bytes payload(64, 0);
        payload[0] = 4;
        payload[4] = static_cast<std::uint8_t>(channel & 0xFF);
        payload[5] = static_cast<std::uint8_t>(channel >> 8);
        return item(0xB17F, timestamp, payload);
    }
    // The LTE serving cell of that identity.
    LogBuilder& servingCell(std::uint64_t timestamp, std::uint8_t identity)
    {
        Bytes payload(40, 0);
        payload[1] = 7; // physical cell
        payload[9] = identity;
        return item(0xB0C2, timestamp, payload);
    }
    LogBuilder& foreign(std::size_t count)
    {
        bytes.insert(bytes.end(), count, 0xED);
        return *this;
    }
    [[nodiscard]] std::shared_ptr<ByteSource> source() const { return sourceOf(bytes); }

    Bytes bytes;

private:
    void put(std::uint64_t value, int width)
    {
        for (int i = 0; i < width; ++i)
            bytes.push_back(static_cast<std::uint8_t>(value >> 8 * i));
    }
};

} // namespace orvane
