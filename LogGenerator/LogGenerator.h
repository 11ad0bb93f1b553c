#pragma once

#include "platform/base/PropertyValue.h"

#include <cstddef>
#include <memory>

namespace orvane
{

// What a generator goes on from: see LogGenerator::checkpoint().
struct GeneratorCheckpoint {
    PropertyValue values;
    std::size_t bytes = 0; // about how much memory it takes
};

// The abstract base of everything that turns log messages into a display. The state dictionary
// belongs to the caller and is passed into every call; its keys are in LogGenerator/StateKeys.h.
class LogGenerator
{
public:
    LogGenerator() = default;
    virtual ~LogGenerator() = default;
    LogGenerator(const LogGenerator&) = delete;
    LogGenerator& operator=(const LogGenerator&) = delete;

    // Logs the creation. Subclasses call it from their own `init`.
    void init();

    // The abstract operations throw UnrecognisedOperation here.

    // Takes one message. What it throws ends that message only.
    virtual void updateState(PropertyDictionary& state, ByteView data);
    // The display to show, absent when there is none yet. Records a snapshot in the history.
    virtual PropertyValue generateLogUsingState(PropertyDictionary& state);
    // The dictionary that starts the log channel.
    [[nodiscard]] virtual PropertyValue getStartCommand() const;
    // An array of the entries that a snapshot file holds.
    virtual PropertyValue getSaveContentsFromState(PropertyDictionary& state);

    // A copy of all that decides what is shown from here on, in the state and in the generator:
    // not the template, the history and the raw messages.
    [[nodiscard]] GeneratorCheckpoint checkpoint(const PropertyDictionary& state) const;
    // Goes on, with this state, as the generator of the same class did after that checkpoint.
    void restore(PropertyDictionary& state, const GeneratorCheckpoint& checkpoint);
    // Keeps no raw messages from now on, for those who never save.
    virtual void keepNoMessages() {}

    // A new generator for the technology that the server named, or null for any other value.
    static std::unique_ptr<LogGenerator> generatorFromTechnology(const PropertyValue& technology);

    // A new array of the history's snapshots, oldest first.
    static PropertyValue historyOf(const PropertyDictionary& state);
    // Appends a snapshot of the state to its "History", which keeps the newest five.
    static void updateHistoryInState(PropertyDictionary& state);

protected:
    // What a checkpoint holds beside the state. Parts of the state may stand in it: they are the
    // same parts of the restored state then.
    virtual void addToCheckpoint(PropertyDictionary&) const {}
    virtual void takeFromCheckpoint(const PropertyValue&) {}
};

} // namespace orvane
