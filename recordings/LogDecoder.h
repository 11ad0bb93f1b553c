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

// Passes the items of a diagnostic log to the generator of its technology, one after the other in
// file order, as if each came from a telephony server.
//
// The time is that of the last item taken. It never goes back. An item without a timestamp, or with
// one that the next items contradict, has the time of the item before. If a decoder throws, only
// that message is lost.
class LogDecoder
{
public:
    // `technology` is a technology constant; throws std::invalid_argument for any other text.
    LogDecoder(std::shared_ptr<ByteSource> log, const std::string& technology);
    ~LogDecoder();

    // Looks for the next item, unless it has been found already. Stops after a megabyte without an
    // item; call it again to go on.
    void lookAhead();
    [[nodiscard]] bool hasNext() const { return _place.hasNext; }
    // No item is left.
    [[nodiscard]] bool isAtEnd() const { return !hasNext() && reader().isAtEnd(); }
    // The time of the next item, if that has been found.
    [[nodiscard]] LogTime nextTime() const { return _place.nextTime; }
    // Decodes the next item, if it has been found, and looks ahead for the one after it.
    void takeNext();

    [[nodiscard]] std::uint64_t itemsTaken() const { return _place.itemsTaken; }
    [[nodiscard]] LogTime time() const { return _place.time; }
    [[nodiscard]] const LogClock& clock() const { return _place.clock; }
    // What is shown now; absent before the first item.
    [[nodiscard]] const PropertyValue& display() const;
    // How often the serving cell has changed, the first cell included. Only the cells that are
    // shown after all items of one time count.
    [[nodiscard]] std::uint64_t servingCellChanges() const { return _place.servingCellChanges; }

    // One line that says why nothing is shown although items were decoded, and what to do: the
    // technology's display template is missing or damaged.
    [[nodiscard]] std::optional<std::string> problem() const;

    // How many of the items found so far have an impossible time.
    [[nodiscard]] std::uint64_t impossibleTimes() const { return _place.impossibleTimes; }

    // Tells how far the log has been read, and what could not be placed.
    [[nodiscard]] const DlfReader& reader() const { return _place.reader; }

    // Whether error lines about messages go to the process's log; not by default.
    void setTellsErrors(bool tells) { _tellsErrors = tells; }

private:
    // Everything that decides what comes next, except the generator and its state.
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
    // A place to continue from.
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
