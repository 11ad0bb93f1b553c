// Checkpoints of generators and their sections.

#include "LogGenerator/SharingCopier.h"
#include "LogGenerator/StateKeys.h"
#include "LogGenerator/VRNLogGenerator2.h"
#include "platform/base/PropertyValue.h"

#include <algorithm>
#include <iterator>

namespace orvane
{

namespace
{

constexpr const char* kStateKey = "State";
constexpr const char* kSectionsKey = "Sections";
constexpr const char* kPartKey = "Part";
constexpr const char* kKeptKey = "Kept";

// Not copied: the template never changes, the others change nothing that is shown.
bool isLeftOut(const std::string& stateKey)
{
    const char* const keys[] = {kTemplateKey, kHistoryKey, kDisplayStateKey};
    return std::find(std::begin(keys), std::end(keys), stateKey) != std::end(keys);
}

} // namespace

GeneratorCheckpoint LogGenerator::checkpoint(const PropertyDictionary& state) const
{
    const PropertyValue values = PropertyValue::newDictionary();
    const PropertyValue shownState = PropertyValue::newDictionary();
    for (const auto& [key, value] : state)
        if (!isLeftOut(key))
            shownState.asDictionary()->set(key, value);
    values.asDictionary()->set(kStateKey, shownState);
    addToCheckpoint(*values.asDictionary());
    // In one go: what refers to parts of the state refers to the same parts of the copy.
    SharingCopier copier;
    const PropertyValue copy = copier.copy(values);
    return {copy, copier.bytes()};
}

void LogGenerator::restore(PropertyDictionary& state, const GeneratorCheckpoint& checkpoint)
{
    const PropertyValue values = SharingCopier().copy(checkpoint.values);
    const PropertyValue displayTemplate = state[kTemplateKey];
    state.clear();
    if (displayTemplate)
        state.set(kTemplateKey, displayTemplate);
    if (const PropertyDictionary* shownState = values[kStateKey].asDictionary())
        for (const auto& [key, value] : *shownState)
            state.set(key, value);
    takeFromCheckpoint(values);
}

void VRNLogGenerator2::addToCheckpoint(PropertyDictionary& values) const
{
    const PropertyValue sections = PropertyValue::newDictionary();
    if (cIndex)
        for (const auto& [name, section] : cIndex->sections())
            sections.asDictionary()->set(name, section->checkpoint());
    values.set(kSectionsKey, sections);
}

void VRNLogGenerator2::takeFromCheckpoint(const PropertyValue& values)
{
    if (cIndex)
        for (const auto& [name, section] : cIndex->sections())
            section->restore(values[kSectionsKey][name]);
}

PropertyValue Base::checkpoint() const
{
    const PropertyValue values = PropertyValue::newDictionary();
    if (const auto shown = rows())
        values.asDictionary()->set(kPartKey, shown);
    if (const auto shown = list())
        values.asDictionary()->set(kPartKey, shown);
    if (const PropertyValue kept = keptValues())
        values.asDictionary()->set(kKeptKey, kept);
    return values;
}

void Base::restore(const PropertyValue& checkpoint)
{
    sectionRef = {checkpoint[kPartKey].sharedDictionary(), checkpoint[kPartKey].sharedArray()};
    takeKeptValues(checkpoint[kKeptKey]);
}

} // namespace orvane
