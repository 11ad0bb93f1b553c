#include "platform/base/PropertyValue.h"

#include <cmath>
#include <gtest/gtest.h>
#include <limits>
#include <stdexcept>

namespace orvane
{
namespace
{

using Type = PropertyValue::Type;

// One value of each type but absent, in the order of Type.
std::vector<PropertyValue> oneOfEachType()
{
    return {
        PropertyValue::newDictionary(),
        PropertyValue::newArray(),
        PropertyValue("text"),
        PropertyValue::integer(7),
        PropertyValue::real(7),
        PropertyValue::boolean(true),
        PropertyValue::data({7}),
        PropertyValue::date({7}),
        PropertyValue::largeNumber({"7"}),
    };
}

TEST(PropertyValueTest, AbsentValueYieldsNothing)
{
    const PropertyValue absent;
    EXPECT_TRUE(absent.isAbsent());
    EXPECT_FALSE(absent);
    EXPECT_EQ(absent.type(), Type::Absent);
    EXPECT_EQ(absent.asDictionary(), nullptr);
    EXPECT_EQ(absent.asArray(), nullptr);
    EXPECT_EQ(absent.sharedDictionary(), nullptr);
    EXPECT_EQ(absent.sharedArray(), nullptr);
    EXPECT_EQ(absent.asString(), nullptr);
    EXPECT_EQ(absent.asData(), nullptr);
    EXPECT_EQ(absent.asInteger(), std::nullopt);
    EXPECT_EQ(absent.asReal(), std::nullopt);
    EXPECT_EQ(absent.asBoolean(), std::nullopt);
    EXPECT_EQ(absent.asDate(), std::nullopt);
    EXPECT_EQ(absent.asLargeNumber(), nullptr);
    EXPECT_TRUE(absent["key"]["of"]["nothing"].isAbsent());
    EXPECT_TRUE(absent.deepCopy().isAbsent());
    EXPECT_EQ(absent.description(), "(null)");
    EXPECT_STREQ(absent.typeName(), "nothing");
    EXPECT_EQ(absent, PropertyValue());
}

TEST(PropertyValueTest, NullContainersAreAbsent)
{
    EXPECT_TRUE(PropertyValue(std::shared_ptr<PropertyDictionary>()).isAbsent());
    EXPECT_TRUE(PropertyValue(std::shared_ptr<PropertyArray>()).isAbsent());
}

TEST(PropertyValueTest, EachValueAnswersForItsOwnTypeOnly)
{
    for (const PropertyValue& value : oneOfEachType()) {
        const char* const name = value.typeName();
        EXPECT_TRUE(value) << name;
        EXPECT_EQ(value.asDictionary() != nullptr, value.type() == Type::Dictionary) << name;
        EXPECT_EQ(value.sharedDictionary().get(), value.asDictionary()) << name;
        EXPECT_EQ(value.asArray() != nullptr, value.type() == Type::Array) << name;
        EXPECT_EQ(value.sharedArray().get(), value.asArray()) << name;
        EXPECT_EQ(value.asString() != nullptr, value.type() == Type::String) << name;
        EXPECT_EQ(value.asInteger().has_value(), value.type() == Type::Integer) << name;
        EXPECT_EQ(value.asReal().has_value(), value.type() == Type::Real) << name;
        EXPECT_EQ(value.asBoolean().has_value(), value.type() == Type::Boolean) << name;
        EXPECT_EQ(value.asData() != nullptr, value.type() == Type::Data) << name;
        EXPECT_EQ(value.asDate().has_value(), value.type() == Type::Date) << name;
        EXPECT_EQ(value.asLargeNumber() != nullptr, value.type() == Type::LargeNumber) << name;
        EXPECT_TRUE(value["key"].isAbsent()) << name;
    }
}

TEST(PropertyValueTest, ScalarsGiveBackWhatTheyWereMadeOf)
{
    EXPECT_EQ(*PropertyValue("text").asString(), "text");
    EXPECT_EQ(*PropertyValue(std::string("a\0b", 3)).asString(), std::string("a\0b", 3));
    EXPECT_EQ(*PropertyValue(std::string_view("view")).asString(), "view");
    EXPECT_EQ(PropertyValue::integer(INT64_MIN).asInteger(), INT64_MIN);
    EXPECT_EQ(PropertyValue::real(-0.5).asReal(), -0.5);
    EXPECT_EQ(PropertyValue::boolean(false).asBoolean(), false);
    EXPECT_EQ(*PropertyValue::data({1, 2}).asData(), (Bytes{1, 2}));
    EXPECT_EQ(PropertyValue::date({-1.5}).asDate(), PropertyDate{-1.5});
}

TEST(PropertyValueTest, CopiesOfContainersShareThem)
{
    const PropertyValue state = PropertyValue::dictionaryOf({
        {"Display", PropertyValue::newDictionary()}
    });
    const PropertyValue display = state["Display"];
    display.asDictionary()->set("Cell Identity", "1234");
    EXPECT_EQ(state["Display"]["Cell Identity"], PropertyValue("1234"));

    const PropertyValue array = PropertyValue::newArray();
    const PropertyValue same = array;
    same.asArray()->append("element");
    EXPECT_EQ(array.asArray()->size(), 1U);
}

TEST(PropertyValueTest, CopiesOfTextsAreIndependent)
{
    const PropertyValue text("one");
    PropertyValue copy = text;
    *copy.asString() += " more";
    EXPECT_EQ(text, PropertyValue("one"));
    EXPECT_EQ(copy, PropertyValue("one more"));
}

TEST(PropertyValueTest, SharedContainerOutlivesTheValue)
{
    std::shared_ptr<PropertyArray> array;
    {
        const PropertyValue value = PropertyValue::arrayOf({"element"});
        array = value.sharedArray();
    }
    ASSERT_NE(array, nullptr);
    EXPECT_EQ((*array)[0], PropertyValue("element"));
    EXPECT_EQ(PropertyValue(array).asArray(), array.get());
}

TEST(PropertyValueTest, DeepCopySharesNoContainer)
{
    const PropertyValue inner = PropertyValue::arrayOf({"one"});
    const PropertyValue original = PropertyValue::dictionaryOf({
        {"list",  inner                                         },
        {"group", PropertyValue::dictionaryOf({{"list", inner}})},
        {"data",  PropertyValue::data({1})                      }
    });
    const PropertyValue copy = original.deepCopy();
    EXPECT_EQ(copy, original);
    inner.asArray()->append("two");
    original["group"].asDictionary()->set("key", "value");
    EXPECT_EQ(copy.description(), "{list = (one); group = {list = (one)}; data = <01>}");
    // What was shared within the original is not shared within the copy.
    copy["list"].asArray()->clear();
    EXPECT_EQ(copy["group"]["list"].asArray()->size(), 1U);
}

TEST(PropertyValueTest, ValuesOfDifferentTypesDiffer)
{
    std::vector<PropertyValue> values = oneOfEachType();
    values.emplace_back();
    for (std::size_t i = 0; i < values.size(); ++i)
        for (std::size_t k = 0; k < values.size(); ++k)
            EXPECT_EQ(values[i] == values[k], i == k)
                << values[i].description() << ' ' << values[k].description();
}

TEST(PropertyValueTest, ValuesOfDifferentContentDiffer)
{
    const auto array = [](const char* text) { return PropertyValue::arrayOf({text}); };
    const auto dictionary = [](const char* key, const char* text) {
        return PropertyValue::dictionaryOf({
            {key, text}
        });
    };
    EXPECT_FALSE(PropertyValue("a") == PropertyValue("b"));
    EXPECT_FALSE(PropertyValue::integer(1) == PropertyValue::integer(2));
    EXPECT_FALSE(PropertyValue::real(1) == PropertyValue::real(2));
    EXPECT_FALSE(PropertyValue::boolean(true) == PropertyValue::boolean(false));
    EXPECT_FALSE(PropertyValue::data({1}) == PropertyValue::data({1, 2}));
    EXPECT_FALSE(PropertyValue::date({1}) == PropertyValue::date({2}));
    EXPECT_FALSE(array("a") == array("b"));
    EXPECT_FALSE(array("a") == PropertyValue::newArray());
    EXPECT_FALSE(dictionary("k", "a") == dictionary("k", "b"));
    EXPECT_FALSE(dictionary("k", "a") == dictionary("l", "a"));
    EXPECT_FALSE(dictionary("k", "a") == PropertyValue::newDictionary());
}

TEST(PropertyValueTest, ArraysAreEqualInTheirOrderDictionariesInAny)
{
    EXPECT_FALSE(PropertyValue::arrayOf({"a", "b"}) == PropertyValue::arrayOf({"b", "a"}));
    EXPECT_EQ(PropertyValue::arrayOf({"a", "b"}), PropertyValue::arrayOf({"a", "b"}));
    EXPECT_EQ(PropertyValue::dictionaryOf({
                  {"a", "1"},
                  {"b", "2"}
    }),
              PropertyValue::dictionaryOf({{"b", "2"}, {"a", "1"}}));
}

TEST(PropertyValueTest, NotANumberEqualsItself)
{
    const double nan = std::numeric_limits<double>::quiet_NaN();
    EXPECT_EQ(PropertyValue::real(nan), PropertyValue::real(-nan));
    EXPECT_EQ(PropertyValue::date({nan}), PropertyValue::date({nan}));
    EXPECT_FALSE(PropertyValue::real(nan) == PropertyValue::real(0));
    EXPECT_EQ(PropertyValue::arrayOf({PropertyValue::real(nan)}),
              PropertyValue::arrayOf({PropertyValue::real(nan)}));
}

TEST(PropertyValueTest, DescriptionIsOneLineInTheOrderOfStorage)
{
    const PropertyValue value = PropertyValue::dictionaryOf({
        {"name",  "a text"                                                },
        {"count", PropertyValue::integer(-3)                              },
        {"half",  PropertyValue::real(0.5)                                },
        {"on",    PropertyValue::boolean(true)                            },
        {"off",   PropertyValue::boolean(false)                           },
        {"bytes", PropertyValue::data({0x00, 0x9F, 0xFF})                 },
        {"when",  PropertyValue::date({1795255200.75})                    },
        {"list",  PropertyValue::arrayOf({"x", PropertyValue::newArray()})},
        {"none",  PropertyValue::newDictionary()                          },
    });
    EXPECT_EQ(PropertyValue::largeNumber({"-1e400", true}).description(), "-1e400");
    EXPECT_EQ(value.description(),
              "{name = a text; count = -3; half = 0.5; on = true; off = false; bytes = <009fff>; "
              "when = 2026-11-21 10:00:00 +0000; list = (x, ()); none = {}}");
}

TEST(PropertyValueTest, TypeNamesSayNumberForEveryKindOfNumber)
{
    std::vector<std::string> names;
    for (const PropertyValue& value : oneOfEachType())
        names.emplace_back(value.typeName());
    EXPECT_EQ(names, (std::vector<std::string>{"dictionary", "array", "string", "number", "number",
                                               "boolean", "data", "date", "number"}));
}

TEST(PropertyValueTest, AbsentValuesCannotBeStored)
{
    EXPECT_THROW(PropertyValue::newDictionary().asDictionary()->set("key", PropertyValue()),
                 std::invalid_argument);
    EXPECT_THROW(PropertyValue::newArray().asArray()->append(PropertyValue()),
                 std::invalid_argument);
    // A refused value leaves the earlier value in place.
    const PropertyValue dictionary = PropertyValue::dictionaryOf({
        {"key", "value"}
    });
    EXPECT_THROW(dictionary.asDictionary()->set("key", PropertyValue()), std::invalid_argument);
    EXPECT_THROW(dictionary.asDictionary()->set("new", PropertyValue()), std::invalid_argument);
    EXPECT_EQ(dictionary.description(), "{key = value}");
}

TEST(PropertyDictionaryTest, KeysKeepTheOrderInWhichTheyWereFirstStored)
{
    PropertyDictionary dictionary;
    dictionary.set("zone", "1");
    dictionary.set("area", "2");
    dictionary.set("zone", "3");
    std::string keys;
    for (const auto& [key, value] : dictionary)
        keys += key + "=" + *value.asString() + " ";
    EXPECT_EQ(keys, "zone=3 area=2 ");
}

TEST(PropertyDictionaryTest, MissingKeyIsAbsentAndIsNotMade)
{
    PropertyDictionary dictionary;
    EXPECT_TRUE(dictionary["key"].isAbsent());
    EXPECT_FALSE(dictionary.contains("key"));
    EXPECT_TRUE(dictionary.empty());
    dictionary.remove("key");
    EXPECT_EQ(dictionary.size(), 0U);
}

TEST(PropertyDictionaryTest, RemovedAndClearedKeysAreAbsent)
{
    PropertyDictionary dictionary;
    for (const char* key : {"a", "b", "c"})
        dictionary.set(key, "value");
    dictionary.remove("b");
    EXPECT_EQ(dictionary.size(), 2U);
    EXPECT_FALSE(dictionary.contains("b"));
    EXPECT_TRUE(dictionary.contains("c"));
    dictionary.clear();
    EXPECT_TRUE(dictionary.empty());
    EXPECT_TRUE(dictionary["a"].isAbsent());
}

TEST(PropertyDictionaryTest, LargeDictionaryKeepsOrderAndValues)
{
    const PropertyValue value = PropertyValue::newDictionary();
    PropertyDictionary& dictionary = *value.asDictionary();
    constexpr int kCount = 20000;
    for (int i = 0; i < kCount; ++i)
        dictionary.set("key " + std::to_string(i), PropertyValue::integer(i));
    ASSERT_EQ(dictionary.size(), std::size_t{kCount});
    int next = 0;
    for (const auto& [key, entry] : dictionary)
        ASSERT_EQ(entry.asInteger(), next++) << key;
    for (int i = 0; i < kCount; i += 77)
        EXPECT_EQ(dictionary["key " + std::to_string(i)], PropertyValue::integer(i));
    EXPECT_EQ(value.deepCopy(), value);
}

TEST(PropertyArrayTest, IndexBeyondTheEndIsAbsent)
{
    PropertyArray array;
    EXPECT_TRUE(array[0].isAbsent());
    array.append("element");
    EXPECT_EQ(array[0], PropertyValue("element"));
    EXPECT_TRUE(array[1].isAbsent());
    EXPECT_TRUE(array[SIZE_MAX].isAbsent());
}

TEST(PropertyArrayTest, ElementsAreRemovedFromTheFront)
{
    struct Case {
        std::size_t removed;
        const char* left;
    };
    for (const auto& [removed, left] : {
             Case{0,        "(a, b, c)"},
             Case{1,        "(b, c)"   },
             Case{3,        "()"       },
             Case{4,        "()"       },
             Case{SIZE_MAX, "()"       }
    }) {
        const PropertyValue array = PropertyValue::arrayOf({"a", "b", "c"});
        array.asArray()->removeFirst(removed);
        EXPECT_EQ(array.description(), left);
    }
}

TEST(PropertyArrayTest, ElementsAreReplacedAndCleared)
{
    const PropertyValue array = PropertyValue::arrayOf({"a"});
    array.asArray()->replaceElements({"b", PropertyValue::integer(3)});
    EXPECT_EQ(array.description(), "(b, 3)");
    EXPECT_EQ(array.asArray()->elements().size(), 2U);
    array.asArray()->clear();
    EXPECT_TRUE(array.asArray()->empty());
}

} // namespace
} // namespace orvane
