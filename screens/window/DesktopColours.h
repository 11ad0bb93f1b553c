#pragma once

#include <QObject>
#include <QPalette>

class QDBusPendingCallWatcher;
class QDBusVariant;

namespace orvane
{

// Lets the palette follow the desktop's wish for light or dark, which it tells on the session bus,
// where Qt itself has not heard of it. Without a bus, or a wish, the palette is Qt's.
class DesktopColours final : public QObject
{
    Q_OBJECT

public:
    enum class Scheme : unsigned { NoPreference = 0, Dark = 1, Light = 2 };

    DesktopColours();

    static void apply(Scheme scheme);
    // What the program needs of its own where the desktop's palette is that one.
    [[nodiscard]] static QPalette paletteFor(Scheme scheme, const QPalette& desktop);

private slots:
    void settingChanged(const QString& group, const QString& key, const QDBusVariant& value);

private:
    static void read(QDBusPendingCallWatcher* call);
};

} // namespace orvane
