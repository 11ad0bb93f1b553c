// Writes a diagnostic log of random messages to standard output, the same ones for the same
// arguments, for tools/compare-outputs.
//   random_log TECHNOLOGY RECORDING COUNT SEED
// Half of the messages are those of the recording with some bytes changed, the others random bytes
// of the codes that the technology's generator asks for.

#include "LogGenerator/LogGenerator.h"
#include "dlf/DlfReader.h"
#include "platform/base/PropertyValue.h"
#include "platform/base/Technology.h"
#include "platform/base/TelephonyConstants.h"
#include "platform/services/FileSystem.h"
#include "platform/services/Services.h"

#include <cstdio>
#include <cstdlib>
#include <random>
#include <string>

namespace
{

using namespace orvane;

// Messages are 10 ms apart, in steps of 1.25 ms, from a day in 2026 on.
constexpr std::uint64_t kFirstStep = 1479000000ULL * 800;
constexpr std::uint64_t kStepsApart = 8;
constexpr std::size_t kHeaderBytes = 12;

class RandomLog
{
public:
    RandomLog(const std::string& technology, const Bytes& recording, std::uint64_t seed)
        : _random(seed)
    {
        DlfReader reader(recording);
        while (const auto item = reader.next())
            if (item->type == 1)
                _recorded.emplace_back(item->bytes.begin(), item->bytes.end());
        const auto generator = LogGenerator::generatorFromTechnology(technology);
        const PropertyValue command = generator->getStartCommand();
        if (const PropertyArray* codes = command[kSetModemLogCodesKey].asArray())
            for (const PropertyValue& code : *codes)
                _codes.push_back(static_cast<std::uint16_t>(code.asInteger().value_or(0)));
    }

    [[nodiscard]] bool isUsable() const { return !_recorded.empty() && !_codes.empty(); }

    Bytes next()
    {
        Bytes item = below(2) == 0 ? changedItem() : randomItem();
        put(item, 0, item.size(), 2);
        put(item, 4, (kFirstStep + kStepsApart * _count++) << 16, 8);
        return item;
    }

private:
    std::uint64_t below(std::uint64_t limit) { return _random() % limit; }

    // Extremes are as frequent as all that lies between them.
    std::uint8_t byte()
    {
        switch (below(4)) {
        case 0:
            return 0;
        case 1:
            return 0xFF;
        case 2:
            return static_cast<std::uint8_t>(below(8));
        default:
            return static_cast<std::uint8_t>(below(256));
        }
    }

    Bytes changedItem()
    {
        Bytes item = _recorded[below(_recorded.size())];
        for (std::uint64_t changes = below(6); item.size() > kHeaderBytes && changes > 0; --changes)
            item[kHeaderBytes + below(item.size() - kHeaderBytes)] = byte();
        return item;
    }

    Bytes randomItem()
    {
        Bytes item(kHeaderBytes + below(below(4) == 0 ? 2000 : 200));
        put(item, 2, _codes[below(_codes.size())], 2);
        for (std::size_t i = kHeaderBytes; i < item.size(); ++i)
            item[i] = byte();
        return item;
    }

    static void put(Bytes& to, std::size_t offset, std::uint64_t value, std::size_t width)
    {
        for (std::size_t i = 0; i < width; ++i)
            to[offset + i] = static_cast<std::uint8_t>(value >> 8 * i);
    }

    std::mt19937_64 _random;
    std::vector<Bytes> _recorded;
    std::vector<std::uint16_t> _codes;
    std::uint64_t _count = 0;
};

} // namespace

int main(int count, char** arguments)
{
    if (count != 5) {
        std::fprintf(stderr, "usage: random_log TECHNOLOGY RECORDING COUNT SEED\n");
        return 2;
    }
    DirectoryResources resources(ORVANE_RESOURCES);
    Services::current().setResources(&resources);
    const auto technology = technologyNamed(arguments[1]);
    const Bytes recording = readFile(arguments[2]).value_or(Bytes());
    if (!technology) {
        std::fprintf(stderr, "random_log: there is no technology \"%s\"\n", arguments[1]);
        return 2;
    }
    RandomLog log(*technology, recording, std::strtoull(arguments[4], nullptr, 10));
    if (!log.isUsable()) {
        std::fprintf(stderr, "random_log: %s has no messages\n", arguments[2]);
        return 1;
    }
    for (std::uint64_t left = std::strtoull(arguments[3], nullptr, 10); left > 0; --left) {
        const Bytes item = log.next();
        if (std::fwrite(item.data(), 1, item.size(), stdout) != item.size())
            return 1;
    }
    return std::fflush(stdout) == 0 ? 0 : 1;
}
