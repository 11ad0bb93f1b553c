#pragma once

#include "LogGenerator/LogGenerator.h"
#include "platform/base/PropertyValue.h"
#include "platform/services/Services.h"

#include <cstddef>
#include <cstdint>
#include <exception>

namespace orvane
{

// Takes every line, so that its text is made, and keeps none.
class DiscardingLog final : public SystemLog
{
public:
    DiscardingLog() : SystemLog(LogPriority::Info) {}
    void write(LogPriority, std::string_view) override {}
};

// Runs the input of a generator's target: a sequence of messages, each after its length in two
// bytes, little-endian. A length beyond the input's end stands for the rest. The messages are
// played through a new generator with the shipped templates, as those of a channel are: an
// exception ends that message only. At the end the display is made twice, since a generator may
// have none the first time, and all of it is read.
template <typename Generator>
int playMessages(const std::uint8_t* data, std::size_t size)
{
    static DirectoryResources resources(ORVANE_RESOURCES);
    static DiscardingLog log;
    Services::current().setResources(&resources);
    Services::current().setLog(&log);

    const auto generator = Generator::generator();
    PropertyDictionary state;
    ByteView rest(data, size);
    while (rest.size() >= 2) {
        const std::size_t claimed = rest[0] + 256U * rest[1];
        rest = rest.subspan(2);
        const std::size_t length = claimed < rest.size() ? claimed : rest.size();
        // A copy of exactly its size, so that the address sanitizer sees one byte too many.
        const Bytes message(rest.begin(), rest.begin() + static_cast<std::ptrdiff_t>(length));
        try {
            generator->updateState(state, message);
        } catch (const std::exception&) { // ends that message only
        }
        rest = rest.subspan(length);
    }
    generator->generateLogUsingState(state);
    const PropertyValue display = generator->generateLogUsingState(state);
    static_cast<void>(display.description());
    static_cast<void>(generator->getSaveContentsFromState(state));
    return 0;
}

} // namespace orvane
