#pragma once

#include "LogGenerator/ClassIndex.h"
#include "LogGenerator/VRNLogGenerator.h"
#include "platform/base/Bytes.h"
#include "platform/base/PropertyValue.h"

#include <memory>
#include <string>

namespace orvane
{

// A generator whose display a template describes and whose class index decodes the messages.
//
// An object whose initWithPListName() was never called has no index, no template and no buffer:
// every operation on it yields nothing.
class VRNLogGenerator2 : public VRNLogGenerator
{
public:
    ~VRNLogGenerator2() override;

    // `pListName` is the template's resource name, without its extension.
    void initWithPListName(std::string pListName, std::shared_ptr<ClassIndex> cIndexObj);

    void updateState(PropertyDictionary& state, ByteView data) override;
    PropertyValue generateLogUsingState(PropertyDictionary& state) override;
    [[nodiscard]] PropertyValue getStartCommand() const override;

    // Routes one message to the sections that subscribe to its code.
    void updateWithData(ByteView data);
    // The live display. The call that builds it returns an absent value, later ones the display.
    PropertyValue getDisplayFromState(PropertyDictionary& state);
    // The live copy of a template; sections found in it are given their parts. Absent (with an
    // error line) for anything but a dictionary, an array or a string; storing that throws.
    PropertyValue processTemplate(const PropertyValue& object);
    // Reports what is neither dictionary, array nor string in the tree.
    static void printDict(const PropertyValue& object);

protected:
    // The sections: their parts of the display and what they keep beside it.
    void addToCheckpoint(PropertyDictionary& values) const override;
    void takeFromCheckpoint(const PropertyValue& values) override;

private:
    PropertyValue loadTemplate(PropertyDictionary& state) const;

    std::string pListName;
    std::shared_ptr<ClassIndex> cIndex;
};

} // namespace orvane
