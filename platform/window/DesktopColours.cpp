#include "platform/window/DesktopColours.h"

#include <QApplication>
#include <QDBusConnection>
#include <QDBusMessage>
#include <QDBusPendingCallWatcher>
#include <QDBusPendingReply>
#include <QDBusVariant>
#include <QPalette>

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

QPalette darkPalette()
{
    const std::array<std::pair<QPalette::ColorRole, QColor>, 10> colours{
        {{QPalette::Window, QColor(0x2B, 0x2D, 0x31)},
         {QPalette::WindowText, QColor(0xE9, 0xEB, 0xEE)},
         {QPalette::Base, QColor(0x18, 0x1A, 0x1F)},
         {QPalette::Text, QColor(0xE9, 0xEB, 0xEE)},
         {QPalette::Button, QColor(0x33, 0x36, 0x3B)},
         {QPalette::ButtonText, QColor(0xE9, 0xEB, 0xEE)},
         {QPalette::ToolTipBase, QColor(0x33, 0x36, 0x3B)},
         {QPalette::ToolTipText, QColor(0xE9, 0xEB, 0xEE)},
         {QPalette::PlaceholderText, QColor(0x8A, 0x93, 0x9E)},
         {QPalette::Highlight, QColor(0x35, 0x6D, 0xB0)}}
    };
    QPalette palette;
    for (const auto& [role, colour] : colours)
        palette.setColor(role, colour);
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

void DesktopColours::apply(Scheme scheme)
{
    // Without one of our own, it is Qt's for this desktop.
    QApplication::setPalette(QPalette());
    constexpr int kHalfLight = 128;
    const bool isDark = QApplication::palette().color(QPalette::Window).lightness() < kHalfLight;
    if (scheme == Scheme::Dark && !isDark)
        QApplication::setPalette(darkPalette());
}

} // namespace orvane
