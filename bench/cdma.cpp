// The messages of CDMA and cell-monitor channels that cost most, from bytes to display rows.

#include "LogGenerator/C2K/C2KLogGenerator.h"
#include "LogGenerator/GSM/GSMLogGenerator.h"
#include "platform/base/PropertyValue.h"
#include "platform/plist/PropertyList.h"
#include "platform/services/Services.h"

#include <benchmark/benchmark.h>

#include <string>

namespace
{

using namespace orvane;

// A message of the code, with zeros where nothing is put.
class Message
{
public:
    Message(std::uint16_t logCode, std::size_t bytes) : _bytes(bytes, 0)
    {
        put8(0, 1);
        put16(3, logCode);
    }
    void put8(std::size_t offset, unsigned value)
    {
        _bytes.at(offset) = static_cast<std::uint8_t>(value);
    }
    void put16(std::size_t offset, unsigned value)
    {
        put8(offset, value & 0xFF);
        put8(offset + 1, value >> 8);
    }
    [[nodiscard]] const Bytes& bytes() const { return _bytes; }

private:
    Bytes _bytes;
};

// A refresh comes at the end of each hundred messages.
template <typename Generator>
void decode(benchmark::State& state, const Bytes& message)
{
    DirectoryResources resources(ORVANE_RESOURCES);
    Services::current().setResources(&resources);
    const auto generator = Generator::generator();
    PropertyDictionary display;
    constexpr int kMessagesARefresh = 100;
    for (auto _ : state) {
        for (int i = 0; i < kMessagesARefresh; ++i)
            generator->updateState(display, message);
        benchmark::DoNotOptimize(generator->generateLogUsingState(display));
    }
    state.SetItemsProcessed(state.iterations() * kMessagesARefresh);
    Services::current().setResources(nullptr);
}

// 288 counters, of which one in three does not count.
void reverseTraffic(benchmark::State& state)
{
    decode<C2KLogGenerator>(state, Message(0x127E, 1750).bytes());
}

// 255 fingers, a row each.
void fingers(benchmark::State& state)
{
    Message message(0x108A, 23 + 14 * 255);
    message.put8(22, 255);
    for (unsigned i = 0; i < 255; ++i)
        message.put16(23 + 14 * i + 6, 1 + i);
    decode<C2KLogGenerator>(state, message.bytes());
}

// 255 pilots, a row each, after a short system state and a short radio subpacket.
void status(benchmark::State& state)
{
    constexpr unsigned kActiveSet = 39;
    constexpr unsigned kPilotBytes = 20;
    constexpr unsigned kActiveSetBytes = 32 + kPilotBytes * 255;
    Message message(0x119C, kActiveSet + kActiveSetBytes + 4);
    message.put8(14, 4);
    message.put8(17, 1);
    message.put16(19, 8);
    message.put8(25, 2);
    message.put16(27, 14);
    message.put8(kActiveSet, 3);
    message.put16(kActiveSet + 2, kActiveSetBytes);
    message.put16(kActiveSet + 4, 64);
    message.put8(kActiveSet + 6, 2);
    message.put8(kActiveSet + 7, 4);
    message.put8(kActiveSet + 8, 255);
    message.put8(kActiveSet + 9, 1);
    for (unsigned i = 0; i < 255; ++i)
        message.put16(kActiveSet + kPilotBytes * i + 28, 100 + i);
    message.put8(kActiveSet + kActiveSetBytes, 4);
    message.put16(kActiveSet + kActiveSetBytes + 2, 4);
    decode<C2KLogGenerator>(state, message.bytes());
}

// 64 cells of 8 rows, half of which collapse.
void cellList(benchmark::State& state)
{
    PropertyValue cells = PropertyValue::newArray();
    for (int i = 0; i < 64; ++i) {
        PropertyValue cell = PropertyValue::newDictionary();
        for (int row = 0; row < 8; ++row) {
            const PropertyValue text(std::to_string(1000 * i + row));
            PropertyValue value = text;
            if (row % 2 == 0) {
                value = PropertyValue::newDictionary();
                value.asDictionary()->set("value", text);
            }
            cell.asDictionary()->set("Row " + std::to_string(row), value);
        }
        cells.asArray()->append(cell);
    }
    const std::string xml = writeXmlPropertyList(cells).value_or("");
    decode<GSMLogGenerator>(state, Bytes(xml.begin(), xml.end()));
}

BENCHMARK(reverseTraffic)->Unit(benchmark::kMicrosecond);
BENCHMARK(fingers)->Unit(benchmark::kMicrosecond);
BENCHMARK(status)->Unit(benchmark::kMicrosecond);
BENCHMARK(cellList)->Unit(benchmark::kMicrosecond);

} // namespace
