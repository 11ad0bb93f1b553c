#pragma once

#include <QObject>
#include <QPalette>

class QDBusPendingCallWatcher;
class QDBusVariant;

namespace orvane
{

// Makes the palette light or dark as the desktop asks for on the session bus, for desktops whose
// setting Qt does not read itself. Without a bus or a setting, the palette is Qt's.
class DesktopColours final : public QObject
{
    Q_OBJECT

public:
    enum class Scheme : unsigned { NoPreference = 0, Dark = 1, Light = 2 };

    DesktopColours();

    static void apply(Scheme scheme);
    // The program's own palette if `desktop` does not fit the scheme, else an empty one.
    [[nodiscard]] static QPalette paletteFor(Scheme scheme, const QPalette& desktop);

private slots:
    void settingChanged(const QString& group, const QString& key, const QDBusVariant& value);

private:
    static void read(QDBusPendingCallWatcher* call);
};

} // namespace orvane
