// The cost of a refresh: from a display to its tree and to a line of JSON.

#include "LogGenerator/LogGenerator.h"
#include "LogGenerator/StateKeys.h"
#include "platform/base/PropertyValue.h"
#include "screens/print/JsonPrinter.h"
#include "ui/tree/OrvaneModelNode.h"

#include <benchmark/benchmark.h>

#include <string>

namespace
{

using namespace orvane;

// Groups of ten rows and lists of records, `rows` rows in all.
PropertyValue display(int rows)
{
    PropertyValue groups = PropertyValue::newDictionary();
    for (int group = 0; group < rows / 20; ++group) {
        PropertyValue flat = PropertyValue::newDictionary();
        PropertyValue record = PropertyValue::newDictionary();
        for (int row = 0; row < 10; ++row) {
            flat.asDictionary()->set("Measured Value " + std::to_string(row), "-101.25 dBm");
            record.asDictionary()->set("Frequency Offset " + std::to_string(row), "12345");
        }
        const std::string name = std::to_string(group);
        groups.asDictionary()->set("Serving Cell Measurements " + name, flat);
        groups.asDictionary()->set("Neighbor Cells List " + name, PropertyValue::arrayOf({record}));
    }
    return groups;
}

void displayToTree(benchmark::State& state)
{
    const PropertyValue shown = display(static_cast<int>(state.range(0)));
    for (auto _ : state) {
        PathDictionary paths;
        benchmark::DoNotOptimize(OrvaneModelNode::makeTreeFromObject(shown, paths));
    }
    state.SetItemsProcessed(state.iterations() * state.range(0));
}

void displayToSnapshot(benchmark::State& state)
{
    PropertyDictionary model;
    model.set(kDisplayStateKey, PropertyValue::data(Bytes(100000, 1)));
    model.set(kDisplayKey, display(static_cast<int>(state.range(0))));
    model.set(kExtraInfoKey, PropertyValue::newDictionary());
    for (auto _ : state)
        LogGenerator::updateHistoryInState(model);
    state.SetItemsProcessed(state.iterations() * state.range(0));
}

void treeToJson(benchmark::State& state)
{
    PathDictionary paths;
    const NodePointer tree =
        OrvaneModelNode::makeTreeFromObject(display(static_cast<int>(state.range(0))), paths);
    std::size_t bytes = 0;
    for (auto _ : state) {
        JsonPrinter pane([&bytes](std::string_view text) { bytes += text.size(); }, false);
        pane.reloadWithNode(tree);
        pane.setStatus("Updated 2026-11-21 at 10:00:00", false);
    }
    state.SetBytesProcessed(static_cast<std::int64_t>(bytes));
}

BENCHMARK(displayToTree)->Arg(100)->Arg(1000)->Unit(benchmark::kMicrosecond);
BENCHMARK(displayToSnapshot)->Arg(1000)->Unit(benchmark::kMicrosecond);
BENCHMARK(treeToJson)->Arg(1000)->Unit(benchmark::kMicrosecond);

} // namespace
