#pragma once

#include "LogGenerator/LogGenerator.h"
#include "LogGenerator/StateKeys.h"
#include "platform/base/PropertyValue.h"
#include "recordings/LogTime.h"
#include "recordings/support/LogFiles.h"

#include <algorithm>
#include <exception>
#include <map>
#include <string>
#include <vector>

namespace orvane
{

// What a live view shows of a log after each of its items, made without the classes that play logs.
struct LiveView {
    struct Moment {
        LogTime time; // of the latest item
        std::string display;
    };

    LiveView(const Bytes& file, const std::string& technology)
    {
        const auto generator = LogGenerator::generatorFromTechnology(technology);
        PropertyDictionary state;
        DlfReader reader(file);
        std::uint64_t first = 0;
        std::uint64_t step = 0;
        while (const auto item = reader.next()) {
            if (first == 0)
                first = item->timestamp >> 16;
            if (item->timestamp != 0)
                step = std::max(step, (item->timestamp >> 16) - first);
            Bytes message = {item->type};
            message.insert(message.end(), item->bytes.begin(), item->bytes.end());
            try {
                generator->updateState(state, message);
            } catch (const std::exception&) {
            }
            moments.push_back(
                {std::chrono::microseconds(step * 1250), state[kDisplayKey].description()});
        }
    }

    [[nodiscard]] LogTime duration() const { return moments.back().time; }
    // After all items before that time; at 0 and at the end see SeekableLog::moveTo().
    [[nodiscard]] std::string at(LogTime time) const
    {
        if (time >= duration())
            return moments.back().display;
        const LogTime end = std::max<LogTime>(time, std::chrono::microseconds(1250));
        const auto behind = std::partition_point(
            moments.begin(), moments.end(), [end](const Moment& each) { return each.time < end; });
        return behind == moments.begin() ? "(null)" : std::prev(behind)->display;
    }
    // The last moment of each period that has items.
    [[nodiscard]] std::vector<Moment> periods(LogTime period) const
    {
        std::vector<Moment> ends;
        for (std::size_t i = 0; i < moments.size(); ++i)
            if (i + 1 == moments.size() || moments[i + 1].time / period != moments[i].time / period)
                ends.push_back(moments[i]);
        return ends;
    }

    std::vector<Moment> moments;
};

// Of a whole drive; made once for all tests.
inline const LiveView& liveViewOf(const RecordedDrive& drive)
{
    static std::map<std::string, LiveView> views;
    const auto known = views.find(drive.file);
    if (known != views.end())
        return known->second;
    return views.emplace(drive.file, LiveView(recordedFile(drive.file), drive.technology))
        .first->second;
}

} // namespace orvane
