#pragma once

#include "LogGenerator/LogGenerator.h"
#include "dlf/DlfReader.h"
#include "insight/ServingCell.h"
#include "platform/base/Bytes.h"
#include "platform/base/PropertyValue.h"
#include "recordings/LogTime.h"

#include <memory>
#include <optional>
#include <string>

namespace orvane
{

// A diagnostic log on its way through the generator of its technology, item by item in file order,
// as if each came from a telephony server.
//
// The time is that of the latest item taken. It never goes back, and an item without a timestamp,
// or with one that those of the next items contradict, has the time of the one before. What a
// message makes a decoder throw costs that message only.
class LogDecoder
{
public:
    // `technology` is a technology constant; throws std::invalid_argument for any other text.
    LogDecoder(std::shared_ptr<ByteSource> log, const std::string& technology);
    ~LogDecoder();

    // Looks for the next item where that has not been found yet, and gives up for now after a
    // megabyte that holds none.
    void lookAhead();
    [[nodiscard]] bool hasNext() const { return _place.hasNext; }
    // No item is left.
    [[nodiscard]] bool isAtEnd() const { return !hasNext() && reader().isAtEnd(); }
    // The next item's time, where it has been found.
    [[nodiscard]] LogTime nextTime() const { return _place.nextTime; }
    // Decodes the next item and looks ahead for the one after it. Nothing where none was found.
    void takeNext();

    [[nodiscard]] std::uint64_t itemsTaken() const { return _place.itemsTaken; }
    [[nodiscard]] LogTime time() const { return _place.time; }
    [[nodiscard]] const LogClock& clock() const { return _place.clock; }
    // What is shown now; absent before the first item.
    [[nodiscard]] const PropertyValue& display() const;
    // How often the serving cell became another one, the first one included, of those that were
    // shown after all items of one time.
    [[nodiscard]] std::uint64_t servingCellChanges() const { return _place.servingCellChanges; }

    // One line that says why nothing is shown although items were decoded, and what to do: the
    // technology's display template is missing or damaged.
    [[nodiscard]] std::optional<std::string> problem() const;

    // How many items that were found so far have a time that cannot be.
    [[nodiscard]] std::uint64_t impossibleTimes() const { return _place.impossibleTimes; }

    // For how far reading has come, and what could not be placed.
    [[nodiscard]] const DlfReader& reader() const { return _place.reader; }

    // Error lines about messages go to the process's log; by default no line does.
    void setTellsErrors(bool tells) { _tellsErrors = tells; }

private:
    // All that it goes on from beside the generator and the generator's state.
    struct Place {
        DlfReader reader; // behind the next item
        ServingCell servingCell;
        LogClock clock{};
        bool hasClock = false;
        Bytes nextMessage{}; // as a server sends it
        bool hasNext = false;
        LogTime nextTime{0};
        LogTime time{0};
        std::uint64_t impossibleTimes = 0;
        std::uint64_t itemsTaken = 0;
        std::uint64_t servingCellChanges = 0;
    };

public:
    // Where it was, to go on from exactly there.
    struct Checkpoint {
        Place place;
        GeneratorCheckpoint generator;

        // About how much memory it takes.
        [[nodiscard]] std::size_t bytes() const;
    };

    [[nodiscard]] Checkpoint checkpoint() const;
    void restore(const Checkpoint& checkpoint);

private:
    [[nodiscard]] bool believe(std::uint64_t timestamp);
    void decodeNext();

    std::string _technology;
    Place _place;
    std::unique_ptr<LogGenerator> _generator;
    PropertyDictionary _state;
    bool _tellsErrors = false;
};

} // namespace orvane
