#include "LogGenerator/Base.h"

#include "LogGenerator/UnrecognisedOperation.h"
#include "platform/base/ArrayLock.h"
#include "platform/services/SystemLog.h"

#include <utility>

namespace orvane
{

namespace
{

struct EnergyBand {
    std::uint32_t threshold; // the band holds ratios above it
    std::int16_t decibels;
};

constexpr EnergyBand kEnergyBands[] = {
    {417647, -1 },
    {331808, -2 },
    {263624, -3 },
    {209463, -4 },
    {166441, -5 },
    {132268, -6 },
    {105123, -7 },
    {83562,  -8 },
    {66435,  -9 },
    {52830,  -10},
    {42023,  -11},
    {33440,  -12},
    {26621,  -13},
    {21205,  -14},
    {16903,  -15},
    {13486,  -16},
    {10771,  -17},
    {8615,   -18},
    {6902,   -19},
    {5542,   -20},
    {4461,   -21},
    {3603,   -22},
    {2921,   -23},
    {2240,   -24},
    {1949,   -25},
    {1607,   -26},
    {1336,   -27},
    {1120,   -28},
    {949,    -29},
    {813,    -30},
 // Deliberate: both of the last bands give -31, and there is no -32.
    {756,    -31},
    {705,    -31},
};

constexpr std::uint32_t kZeroDecibels = 524288;

} // namespace

void Base::init() { sectionRef = {}; }

void Base::initWithDict(ClassDictionary& classDict, CodeDictionary& codeDict)
{
    init();
    classDict[getSectionName()] = this;
    updateLogCodeDict(codeDict);
}

void Base::updateSectionRef(const PropertyValue& subtree)
{
    init();
    if (subtree.type() != subtreeType())
        logError("The template's part for \"%s\" is of type %s instead of %s: it stays empty",
                 getSectionName().c_str(), subtree.typeName(),
                 subtreeType() == PropertyValue::Type::Array ? "array" : "dictionary");
    else if (subtreeType() == PropertyValue::Type::Array)
        sectionRef.list = subtree.sharedArray();
    else
        sectionRef.rows = subtree.sharedDictionary();
    logWarning("%s", getSectionName().c_str());
}

void Base::updateWithData(ByteView, std::uint32_t)
{
    throw UnrecognisedOperation("Base updateWithData");
}

std::string Base::getSectionName() const { throw UnrecognisedOperation("Base getSectionName"); }

std::vector<std::uint32_t> Base::getLogCodeArray() const
{
    throw UnrecognisedOperation("Base getLogCodeArray");
}

PropertyValue::Type Base::subtreeType() const { return PropertyValue::Type::Dictionary; }

void Base::updateLogCodeDict(CodeDictionary& codeDict)
{
    const std::vector<std::uint32_t> codes = getLogCodeArray();
    logWarning("Array Count: %d", static_cast<int>(codes.size()));
    for (const std::uint32_t code : codes)
        codeDict[std::to_string(code)].push_back(this);
}

void Base::clearElementsInArray(PropertyArray* array)
{
    if (!array)
        return;
    const ArrayLock::Guard guard;
    array->clear();
}

void Base::replaceArray(PropertyArray* array, std::vector<PropertyValue> with)
{
    if (!array)
        return;
    const ArrayLock::Guard guard;
    array->replaceElements(std::move(with));
}

std::vector<PropertyValue> Base::takeElements(PropertyArray* array)
{
    if (!array)
        return {};
    const ArrayLock::Guard guard;
    return array->replaceElements({});
}

std::int16_t Base::lookUpECNO(std::uint32_t ratio)
{
    if (ratio >= kZeroDecibels)
        return 0;
    for (const EnergyBand& band : kEnergyBands)
        if (ratio > band.threshold)
            return band.decibels;
    // Deliberate: the very weakest give 0, as the strongest do.
    return 0;
}

} // namespace orvane
