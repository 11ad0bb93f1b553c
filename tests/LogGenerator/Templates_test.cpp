// Compares every class index with the template that the program ships for it.

#include "LogGenerator/DictionaryResource.h"
#include "LogGenerator/GSM/VRN_GSMClassIndex.h"
#include "LogGenerator/LTE/LTEClassIndex.h"
#include "LogGenerator/UTRAN/UTRANClassIndex.h"
#include "platform/base/PropertyValue.h"
#include "support/Recording.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <functional>

namespace orvane
{

namespace
{

using ::testing::IsEmpty;

template <typename Index>
std::unique_ptr<ClassIndex> makeIndex()
{
    auto index = std::make_unique<Index>();
    index->init();
    return index;
}

struct Shipped {
    const char* name; // of the template
    std::unique_ptr<ClassIndex> (*index)();
};

constexpr Shipped kShipped[] = {
    {"VRN_GSM", makeIndex<VRN_GSMClassIndex>},
    {"LTE",     makeIndex<LTEClassIndex>    },
    {"UTRAN",   makeIndex<UTRANClassIndex>  },
};

class TemplatesTest : public ::testing::TestWithParam<Shipped>
{
protected:
    [[nodiscard]] PropertyValue load() const
    {
        return loadDictionaryResource(services.shippedResources, GetParam().name);
    }

    TestServices services;
    std::unique_ptr<ClassIndex> index = GetParam().index();
};

} // namespace

TEST_P(TemplatesTest, EverySectionHasItsPartAtTheTopAndOfItsKind)
{
    const PropertyValue shipped = load();
    ASSERT_TRUE(shipped);
    ASSERT_FALSE(index->sections().empty());
    for (const auto& [name, section] : index->sections()) {
        const PropertyValue& part = shipped[name];
        EXPECT_EQ(part.type(), section->subtreeType())
            << '"' << name << "\" is of type " << part.typeName();
    }
}

TEST_P(TemplatesTest, ItHoldsNothingElse)
{
    const PropertyValue shipped = load();
    ASSERT_TRUE(shipped);
    for (const auto& [name, part] : *shipped.asDictionary())
        EXPECT_TRUE(index->getClass(name)) << '"' << name << "\" is no section's name";
    EXPECT_THAT(services.log.errors(), IsEmpty());
}

INSTANTIATE_TEST_SUITE_P(Shipped, TemplatesTest, ::testing::ValuesIn(kShipped),
                         [](const auto& parameter) { return std::string(parameter.param.name); });

} // namespace orvane
