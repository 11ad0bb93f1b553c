#include "platform/linux/QtPreferencesStore.h"

#include "platform/base/PropertyValue.h"
#include "platform/services/SystemLog.h"

#include <QDBusConnection>
#include <QDBusMessage>
#include <QSettings>
#include <QStandardPaths>

namespace orvane
{

namespace
{

QString fileOf(const std::string& domain)
{
    return QStandardPaths::writableLocation(QStandardPaths::GenericConfigLocation) +
           "/orvane-preferences/" + QString::fromStdString(domain) + ".ini";
}

QVariant variantOf(const PropertyValue& value)
{
    if (const auto flag = value.asBoolean())
        return *flag;
    if (const auto number = value.asInteger())
        return static_cast<qlonglong>(*number);
    if (const std::string* text = value.asString())
        return QString::fromStdString(*text);
    return QString::fromStdString(value.description());
}

} // namespace

QtPreferencesStore::QtPreferencesStore() = default;

QtPreferencesStore::~QtPreferencesStore() = default;

QSettings& QtPreferencesStore::settings(const std::string& domain)
{
    auto& open = _open[domain];
    if (!open)
        open = std::make_unique<QSettings>(fileOf(domain), QSettings::IniFormat);
    return *open;
}

void QtPreferencesStore::setValue(const std::string& domain, const std::string& key,
                                  const PropertyValue& value)
{
    settings(domain).setValue(QString::fromStdString(key), variantOf(value));
}

void QtPreferencesStore::synchronize(const std::string& domain)
{
    QSettings& open = settings(domain);
    open.sync();
    if (open.status() != QSettings::NoError)
        logError("The preferences in %s cannot be written", qUtf8Printable(open.fileName()));
    _open.erase(domain);
}

void QtPreferencesStore::postChangeNotice(const std::string& domain, const std::string& key)
{
    // Without an address Qt would look for a bus, or start one.
    if (qEnvironmentVariableIsEmpty("DBUS_SESSION_BUS_ADDRESS"))
        return;
    QDBusConnection bus = QDBusConnection::sessionBus();
    if (!bus.isConnected())
        return;
    QDBusMessage notice =
        QDBusMessage::createSignal("/org/orvane/Preferences", "org.orvane.Preferences", "Changed");
    notice << QString::fromStdString(domain) << QString::fromStdString(key);
    bus.send(notice);
}

} // namespace orvane
