#include "screens/window/DesktopColours.h"

#include <QApplication>
#include <QDBusConnection>
#include <QDBusMessage>
#include <QDBusPendingCallWatcher>
#include <QDBusPendingReply>
#include <QDBusVariant>

#include <array>
#include <utility>

namespace orvane
{

namespace
{

constexpr const char* kService = "org.freedesktop.portal.Desktop";
constexpr const char* kPath = "/org/freedesktop/portal/desktop";
constexpr const char* kInterface = "org.freedesktop.portal.Settings";
constexpr const char* kGroup = "org.freedesktop.appearance";
constexpr const char* kKey = "color-scheme";

using Colours = std::array<std::pair<QPalette::ColorRole, QRgb>, 10>;

constexpr Colours kDark{
    {{QPalette::Window, 0x2B2D31},
     {QPalette::WindowText, 0xE9EBEE},
     {QPalette::Base, 0x181A1F},
     {QPalette::Text, 0xE9EBEE},
     {QPalette::Button, 0x33363B},
     {QPalette::ButtonText, 0xE9EBEE},
     {QPalette::ToolTipBase, 0x33363B},
     {QPalette::ToolTipText, 0xE9EBEE},
     {QPalette::PlaceholderText, 0x8A939E},
     {QPalette::Highlight, 0x356DB0}}
};

constexpr Colours kLight{
    {{QPalette::Window, 0xF0F1F3},
     {QPalette::WindowText, 0x1B1F24},
     {QPalette::Base, 0xFFFFFF},
     {QPalette::Text, 0x1B1F24},
     {QPalette::Button, 0xE6E9EE},
     {QPalette::ButtonText, 0x1B1F24},
     {QPalette::ToolTipBase, 0xFFFFFF},
     {QPalette::ToolTipText, 0x1B1F24},
     {QPalette::PlaceholderText, 0x6B7480},
     {QPalette::Highlight, 0x1A5FB4}}
};

QPalette paletteOf(const Colours& colours)
{
    QPalette palette;
    for (const auto& [role, colour] : colours)
        palette.setColor(role, QColor(colour));
    return palette;
}

// The value may be wrapped more than once.
QVariant unwrapped(QVariant value)
{
    while (value.canConvert<QDBusVariant>())
        value = value.value<QDBusVariant>().variant();
    return value;
}

DesktopColours::Scheme schemeOf(const QVariant& value)
{
    switch (unwrapped(value).toUInt()) {
    case 1:
        return DesktopColours::Scheme::Dark;
    case 2:
        return DesktopColours::Scheme::Light;
    default:
        return DesktopColours::Scheme::NoPreference;
    }
}

} // namespace

DesktopColours::DesktopColours()
{
    QDBusConnection bus = QDBusConnection::sessionBus();
    if (!bus.isConnected())
        return;
    bus.connect(kService, kPath, kInterface, QStringLiteral("SettingChanged"), this,
                SLOT(settingChanged(QString, QString, QDBusVariant)));
    QDBusMessage question =
        QDBusMessage::createMethodCall(kService, kPath, kInterface, QStringLiteral("Read"));
    question << QString::fromLatin1(kGroup) << QString::fromLatin1(kKey);
    auto* call = new QDBusPendingCallWatcher(bus.asyncCall(question), this);
    connect(call, &QDBusPendingCallWatcher::finished, this, &DesktopColours::read);
}

void DesktopColours::read(QDBusPendingCallWatcher* call)
{
    const QDBusPendingReply<QDBusVariant> answer = *call;
    call->deleteLater();
    if (!answer.isError())
        apply(schemeOf(answer.value().variant()));
}

void DesktopColours::settingChanged(const QString& group, const QString& key,
                                    const QDBusVariant& value)
{
    if (group == QLatin1String(kGroup) && key == QLatin1String(kKey))
        apply(schemeOf(value.variant()));
}

QPalette DesktopColours::paletteFor(Scheme scheme, const QPalette& desktop)
{
    constexpr int kHalfLight = 128;
    const bool isDark = desktop.color(QPalette::Window).lightness() < kHalfLight;
    if (scheme == Scheme::Dark && !isDark)
        return paletteOf(kDark);
    return scheme == Scheme::Light && isDark ? paletteOf(kLight) : QPalette();
}

void DesktopColours::apply(Scheme scheme)
{
    // An empty palette gives Qt's own for this desktop.
    QApplication::setPalette(QPalette());
    QApplication::setPalette(paletteFor(scheme, QApplication::palette()));
}

} // namespace orvane
