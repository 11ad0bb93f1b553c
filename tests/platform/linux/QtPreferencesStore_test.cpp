#include "platform/linux/QtPreferencesStore.h"

#include "platform/base/PropertyValue.h"

#include "support/Recording.h"
#include "support/TemporaryDirectory.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cstdlib>
#include <fstream>
#include <sstream>

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::IsEmpty;

class QtPreferencesStoreTest : public ::testing::Test
{
protected:
    QtPreferencesStoreTest()
    {
        keepIn(directory.path());
        ::unsetenv("DBUS_SESSION_BUS_ADDRESS");
    }
    ~QtPreferencesStoreTest() override { ::unsetenv("XDG_CONFIG_HOME"); }

    static void keepIn(const std::string& folder)
    {
        ::setenv("XDG_CONFIG_HOME", folder.c_str(), 1);
    }
    [[nodiscard]] std::string file() const
    {
        const std::ifstream stream(directory.path() + "/orvane-preferences/home-screen.ini");
        std::ostringstream text;
        text << stream.rdbuf();
        return text.str();
    }

    TestServices services;
    TemporaryDirectory directory;
    QtPreferencesStore store;
};

} // namespace

TEST_F(QtPreferencesStoreTest, WritesAnIniFileADomain)
{
    store.setValue("home-screen", "HSShowGSMRSSI", PropertyValue::boolean(false));
    store.synchronize("home-screen");
    EXPECT_THAT(file(), HasSubstr("HSShowGSMRSSI=false"));
    store.setValue("home-screen", "Other", PropertyValue::integer(7));
    store.synchronize("home-screen");
    EXPECT_THAT(file(), HasSubstr("HSShowGSMRSSI=false"));
    EXPECT_THAT(file(), HasSubstr("Other=7"));
    EXPECT_THAT(services.log.errors(), IsEmpty());
}

TEST_F(QtPreferencesStoreTest, WhatCannotBeWrittenIsToldInOneErrorLine)
{
    keepIn("/proc/nowhere");
    store.setValue("home-screen", "HSShowGSMRSSI", PropertyValue::boolean(false));
    store.synchronize("home-screen");
    EXPECT_THAT(services.log.errors(),
                ElementsAre("The preferences in /proc/nowhere/orvane-preferences/home-screen.ini "
                            "cannot be written"));
}

TEST_F(QtPreferencesStoreTest, WithoutASessionBusANoticeGoesNowhere)
{
    store.postChangeNotice("home-screen", "HSShowGSMRSSI");
    EXPECT_THAT(services.log.errors(), IsEmpty());
}

} // namespace orvane
