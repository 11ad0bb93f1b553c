#include "platform/linux/QtPreferencesStore.h"

#include "platform/base/PropertyValue.h"
#include "platform/linux/BoundedCall.h"
#include "platform/services/SystemLog.h"

#include <QDBusConnection>
#include <QDBusMessage>
#include <QSettings>
#include <QStandardPaths>

#include <atomic>
#include <memory>
#include <utility>
#include <vector>

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

void QtPreferencesStore::setValue(const std::string& domain, const std::string& key,
                                  const PropertyValue& value)
{
    _unwritten[domain].set(key, value);
}

void QtPreferencesStore::synchronize(const std::string& domain)
{
    const auto found = _unwritten.find(domain);
    if (found == _unwritten.end())
        return;
    std::vector<std::pair<QString, QVariant>> values;
    for (const auto& [key, value] : found->second)
        values.emplace_back(QString::fromStdString(key), variantOf(value));
    _unwritten.erase(found);
    const QString file = fileOf(domain);
    const auto isWritten = std::make_shared<std::atomic<bool>>(false);
    const bool hasEnded = runWithin(kPatience, [file, values = std::move(values), isWritten] {
        QSettings settings(file, QSettings::IniFormat);
        for (const auto& [key, value] : values)
            settings.setValue(key, value);
        settings.sync();
        *isWritten = settings.status() == QSettings::NoError;
    });
    if (!hasEnded)
        logError("The preferences in %s are not written: the file is in use", qUtf8Printable(file));
    else if (!*isWritten)
        logError("The preferences in %s cannot be written", qUtf8Printable(file));
}

void QtPreferencesStore::postChangeNotice(const std::string& domain, const std::string& key)
{
    // Without an address Qt would look for a bus, or start one.
    if (qEnvironmentVariableIsEmpty("DBUS_SESSION_BUS_ADDRESS"))
        return;
    const bool hasEnded = runWithin(kPatience, [domain, key] {
        QDBusConnection bus = QDBusConnection::sessionBus();
        if (!bus.isConnected())
            return;
        QDBusMessage notice = QDBusMessage::createSignal("/org/orvane/Preferences",
                                                         "org.orvane.Preferences", "Changed");
        notice << QString::fromStdString(domain) << QString::fromStdString(key);
        bus.send(notice);
    });
    if (!hasEnded)
        logError("Other programs are not told of changed preferences: the session bus does not "
                 "answer");
}

} // namespace orvane
