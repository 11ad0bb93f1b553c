// The cost of reading a message with a cell array, in both formats, and of writing a list.

#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"
#include "platform/plist/PropertyList.h"

#include <benchmark/benchmark.h>
#include <stdexcept>
#include <string>
#include <vector>

namespace
{

using orvane::Bytes;
using orvane::PropertyValue;

constexpr int kCells = 8;

PropertyValue cellArray()
{
    PropertyValue cells = PropertyValue::newArray();
    for (int i = 0; i < kCells; ++i) {
        const auto number = [i](int base) { return PropertyValue::integer(base + i); };
        cells.asArray()->append(PropertyValue::dictionaryOf({
            {"kTSCellMonitorCellRadioAccessTechnology", "kTSCellMonitorRadioAccessTechnologyLTE"},
            {"kTSCellMonitorCellType",
             i == 0 ? "kTSCellMonitorCellTypeServing" : "kTSCellMonitorCellTypeNeighbor"        },
            {"kTSCellMonitorMCC",                       PropertyValue::integer(262)             },
            {"kTSCellMonitorMNC",                       PropertyValue::integer(1)               },
            {"kTSCellMonitorTAC",                       number(20000)                           },
            {"kTSCellMonitorCellId",                    number(27447297)                        },
            {"kTSCellMonitorPID",                       number(100)                             },
            {"kTSCellMonitorUARFCN",                    number(1300)                            },
        }));
    }
    return cells;
}

// A binary list of dictionaries of integers and strings. Equal keys and strings share one object,
// as in lists of common writers. All object indexes and offsets have two bytes.
class BinaryWriter
{
public:
    static Bytes write(const PropertyValue& dictionaries)
    {
        BinaryWriter writer;
        Bytes root = {0xA0};
        root[0] |= static_cast<std::uint8_t>(dictionaries.asArray()->size());
        for (const PropertyValue& entry : *dictionaries.asArray())
            append(root, writer.addDictionary(*entry.asDictionary()), 2);
        const std::size_t rootIndex = writer.add(root);
        const std::size_t table = writer._bytes.size();
        for (const std::size_t offset : writer._offsets)
            append(writer._bytes, offset, 2);
        writer._bytes.insert(writer._bytes.end(), 6, 0);
        append(writer._bytes, 2, 1);
        append(writer._bytes, 2, 1);
        for (const std::size_t number : {writer._offsets.size(), rootIndex, table})
            append(writer._bytes, number, 8);
        return writer._bytes;
    }

private:
    static void append(Bytes& to, std::size_t number, int width)
    {
        for (int shift = 8 * (width - 1); shift >= 0; shift -= 8)
            to.push_back(static_cast<std::uint8_t>(number >> shift));
    }
    std::size_t add(const Bytes& object)
    {
        _offsets.push_back(_bytes.size());
        _bytes.insert(_bytes.end(), object.begin(), object.end());
        return _offsets.size() - 1;
    }
    std::size_t addText(const std::string& text)
    {
        if (const std::size_t* const known = _texts.find(text))
            return *known;
        Bytes object = {0x5F, 0x10, static_cast<std::uint8_t>(text.size())};
        object.insert(object.end(), text.begin(), text.end());
        return _texts[text] = add(object);
    }
    std::size_t addInteger(std::int64_t number)
    {
        Bytes object = {0x12};
        append(object, static_cast<std::size_t>(number), 4);
        return add(object);
    }
    std::size_t addDictionary(const orvane::PropertyDictionary& dictionary)
    {
        Bytes keys;
        Bytes values;
        for (const auto& [key, value] : dictionary) {
            append(keys, addText(key), 2);
            append(values,
                   value.asString() ? addText(*value.asString()) : addInteger(*value.asInteger()),
                   2);
        }
        Bytes object = {static_cast<std::uint8_t>(0xD0 | dictionary.size())};
        object.insert(object.end(), keys.begin(), keys.end());
        object.insert(object.end(), values.begin(), values.end());
        return add(object);
    }

    Bytes _bytes = {'b', 'p', 'l', 'i', 's', 't', '0', '0'};
    std::vector<std::size_t> _offsets;
    orvane::OrderedMap<std::size_t> _texts;
};

void readRepeatedly(benchmark::State& state, const Bytes& bytes)
{
    if (!(orvane::readPropertyList(bytes).value == cellArray()))
        throw std::logic_error("the list does not read as what it was made of");
    for (auto _ : state)
        benchmark::DoNotOptimize(orvane::readPropertyList(bytes));
    state.SetBytesProcessed(static_cast<std::int64_t>(state.iterations() * bytes.size()));
}

void readXmlCellArray(benchmark::State& state)
{
    const std::string text = *orvane::writeXmlPropertyList(cellArray());
    readRepeatedly(state, Bytes(text.begin(), text.end()));
}
BENCHMARK(readXmlCellArray);

void readBinaryCellArray(benchmark::State& state)
{
    readRepeatedly(state, BinaryWriter::write(cellArray()));
}
BENCHMARK(readBinaryCellArray);

void writeXmlCellArray(benchmark::State& state)
{
    const PropertyValue cells = cellArray();
    for (auto _ : state)
        benchmark::DoNotOptimize(orvane::writeXmlPropertyList(cells));
}
BENCHMARK(writeXmlCellArray);

} // namespace
