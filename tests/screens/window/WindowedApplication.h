#pragma once

#include "app/OrvaneApp.h"
#include "doubles/FakePreferencesStore.h"
#include "doubles/LoopbackTransport.h"
#include "doubles/ScriptedTelephonyServer.h"
#include "platform/ports/MessagePorts.h"
#include "platform/ports/TelephonyServer.h"
#include "screens/window/WindowTest.h"

#include <QTest>

#include <filesystem>

namespace orvane
{

// Runs the application in its window with a scripted telephony server.
class WindowedApplication : public ::testing::Test
{
protected:
    explicit WindowedApplication(QtScreen::Settings settings = stillSettings())
        : screen(std::move(settings))
    {
        services.useShippedResources();
        for (const char* folder : {kInstallMarker, kLogFolder})
            std::filesystem::create_directories(files.located(folder));
        screen.frame().resize(360, 640);
    }
    ~WindowedApplication() override { app.applicationWillTerminate(); }

    static QtScreen::Settings stillSettings()
    {
        QtScreen::Settings settings;
        settings.isAnimated = false;
        return settings;
    }

    void launch()
    {
        app.applicationDidFinishLaunching();
        queue.runPending();
        turnEvents();
    }
    void turn(std::chrono::nanoseconds time)
    {
        queue.advance(time);
        turnEvents();
    }
    [[nodiscard]] WindowFrame& frame() const { return screen.frame(); }
    [[nodiscard]] TableWidget& table() const { return frame().deck().top()->table(); }
    // The index of the row with that key; the number of rows if there is none.
    [[nodiscard]] std::size_t rowOf(const QString& key) const
    {
        std::size_t row = 0;
        while (table().rowWidget(row) && table().rowWidget(row)->content().key() != key)
            ++row;
        return row;
    }
    void openRow(const QString& key)
    {
        RowWidget* row = table().rowWidget(rowOf(key));
        ASSERT_TRUE(row) << key.toStdString();
        QTest::mouseClick(&table(), Qt::LeftButton, {}, row->geometry().center());
        turnEvents();
    }

    TestServices services;
    TemporaryDirectory root;
    FileSystem files{root.path()};
    ManualMainQueue queue;
    LoopbackTransport transport{queue};
    MessagePorts ports{transport, queue};
    TelephonyServer client{transport, ports, queue};
    ScriptedTelephonyServer server{transport};
    FakePreferencesStore preferences;
    QtScreen screen;
    OrvaneApp app{
        ModelEnvironment{queue, ports, client, std::chrono::seconds(2),
                         [] { return std::optional<std::string>("UUID"); }},
        files, preferences
    };
};

} // namespace orvane
