#pragma once

#include "platform/base/PropertyValue.h"

#include <cstdint>
#include <memory>
#include <string>
#include <vector>

namespace orvane
{

class Base;

// Log code, as decimal text, to the sections that subscribe to it, in registration order.
using CodeDictionary = OrderedMap<std::vector<Base*>>;
// Section name to section.
using ClassDictionary = OrderedMap<Base*>;

// One decoder: a section owns one named part of the display and understands one or more log codes.
// Codes of 0xFF0000 and above are items that the telephony server itself makes.
//
// A class index makes sections and owns them; the display belongs to the state, and a section whose
// part of it is gone, or was never there, writes nowhere.
class Base
{
public:
    Base() = default;
    virtual ~Base() = default;
    Base(const Base&) = delete;
    Base& operator=(const Base&) = delete;

    // Registers the section under its name and its log codes.
    void initWithDict(ClassDictionary& classDict, CodeDictionary& codeDict);

    // Takes the part of the display to write into. One of the wrong kind is reported and not taken.
    virtual void updateSectionRef(const PropertyValue& subtree);
    // Decodes one message (13-byte header included) of one of the section's codes. Too short a
    // packet leaves the rows as they were. Abstract: throws UnrecognisedOperation.
    virtual void updateWithData(ByteView data, std::uint32_t logCode);
    // The key of the section's part in the template. Abstract.
    [[nodiscard]] virtual std::string getSectionName() const;
    // The log codes to subscribe to. Abstract.
    [[nodiscard]] virtual std::vector<std::uint32_t> getLogCodeArray() const;
    // Whether the section's part of the display is a dictionary of rows or an array of records.
    [[nodiscard]] virtual PropertyValue::Type subtreeType() const;

    void updateLogCodeDict(CodeDictionary& codeDict);

    // All that the section goes on from: its part of the display, shared, and what it keeps from
    // one packet to the next. restore() takes such a value back.
    [[nodiscard]] PropertyValue checkpoint() const;
    void restore(const PropertyValue& checkpoint);

    // These change the array under ArrayLock, so that no reader sees it half filled. The last one
    // leaves it empty and returns what it held.
    static void clearElementsInArray(PropertyArray* array);
    static void replaceArray(PropertyArray* array, std::vector<PropertyValue> with);
    static std::vector<PropertyValue> takeElements(PropertyArray* array);

    // A linear energy ratio, 2^19 being 0 dB, in whole decibels.
    static std::int16_t lookUpECNO(std::uint32_t ratio);

protected:
    // The section's part of the display, or null when there is none (any more).
    [[nodiscard]] std::shared_ptr<PropertyDictionary> rows() const
    {
        return sectionRef.rows.lock();
    }
    [[nodiscard]] std::shared_ptr<PropertyArray> list() const { return sectionRef.list.lock(); }

    // What a section with fields of its own keeps in them, and the inverse; by default nothing.
    [[nodiscard]] virtual PropertyValue keptValues() const { return {}; }
    virtual void takeKeptValues(const PropertyValue&) {}

private:
    void init();

    // A part of the display, not owned. At most one of the two is set.
    struct DisplayReference {
        std::weak_ptr<PropertyDictionary> rows;
        std::weak_ptr<PropertyArray> list;
    };

    DisplayReference sectionRef;
};

} // namespace orvane
