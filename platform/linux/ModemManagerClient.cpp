#include "platform/linux/ModemManagerClient.h"

#include "platform/base/PropertyValue.h"
#include "platform/linux/QtMainQueue.h"

#include <QDBusArgument>
#include <QDBusConnection>
#include <QDBusMessage>
#include <QDBusPendingCall>
#include <QDBusPendingCallWatcher>
#include <QDBusPendingReply>
#include <QDBusServiceWatcher>
#include <QDBusVariant>
#include <QObject>

#include <limits>
#include <utility>

namespace orvane
{

namespace
{

const QString kService = QStringLiteral("org.freedesktop.ModemManager1");
const QString kPath = QStringLiteral("/org/freedesktop/ModemManager1");
const QString kObjectManager = QStringLiteral("org.freedesktop.DBus.ObjectManager");
const QString kProperties = QStringLiteral("org.freedesktop.DBus.Properties");
constexpr int kAnswerTimeMs = 5000;
// Deeper values than ModemManager has are cut off.
constexpr int kDeepest = 16;

PropertyValue valueOf(const QVariant& variant, int depth);

PropertyValue valueOf(const QDBusArgument& argument, int depth)
{
    switch (argument.currentType()) {
    case QDBusArgument::ArrayType:
    case QDBusArgument::StructureType: {
        const bool isArray = argument.currentType() == QDBusArgument::ArrayType;
        auto array = PropertyValue::newArray();
        isArray ? argument.beginArray() : argument.beginStructure();
        while (!argument.atEnd())
            if (auto element = valueOf(argument, depth + 1))
                array.asArray()->append(std::move(element));
        isArray ? argument.endArray() : argument.endStructure();
        return array;
    }
    case QDBusArgument::MapType: {
        auto dictionary = PropertyValue::newDictionary();
        argument.beginMap();
        while (!argument.atEnd()) {
            argument.beginMapEntry();
            const std::string key = valueOf(argument, depth + 1).description();
            if (auto value = valueOf(argument, depth + 1))
                dictionary.asDictionary()->set(key, std::move(value));
            argument.endMapEntry();
        }
        argument.endMap();
        return dictionary;
    }
    case QDBusArgument::BasicType:
    case QDBusArgument::VariantType:
        return valueOf(argument.asVariant(), depth + 1);
    default:
        // Read all the same: the argument would otherwise stay where it is.
        (void)argument.asVariant();
        return {};
    }
}

PropertyValue valueOf(const QVariant& variant, int depth)
{
    if (depth > kDeepest)
        return {};
    if (variant.userType() == qMetaTypeId<QDBusArgument>())
        return valueOf(qvariant_cast<QDBusArgument>(variant), depth);
    if (variant.userType() == qMetaTypeId<QDBusVariant>())
        return valueOf(qvariant_cast<QDBusVariant>(variant).variant(), depth + 1);
    if (variant.userType() == qMetaTypeId<QDBusObjectPath>())
        return qvariant_cast<QDBusObjectPath>(variant).path().toStdString();
    switch (variant.typeId()) {
    case QMetaType::Bool:
        return PropertyValue::boolean(variant.toBool());
    case QMetaType::UChar:
    case QMetaType::Short:
    case QMetaType::UShort:
    case QMetaType::Int:
    case QMetaType::UInt:
    case QMetaType::LongLong:
        return PropertyValue::integer(variant.toLongLong());
    case QMetaType::ULongLong:
        if (variant.toULongLong() > std::numeric_limits<std::int64_t>::max())
            return {};
        return PropertyValue::integer(variant.toLongLong());
    case QMetaType::Double:
        return PropertyValue::real(variant.toDouble());
    case QMetaType::QString:
        return variant.toString().toStdString();
    case QMetaType::QStringList:
    case QMetaType::QVariantList: {
        auto array = PropertyValue::newArray();
        for (const QVariant& each : variant.toList())
            if (auto element = valueOf(each, depth + 1))
                array.asArray()->append(std::move(element));
        return array;
    }
    case QMetaType::QByteArray: {
        const QByteArray bytes = variant.toByteArray();
        return PropertyValue::data(Bytes(bytes.begin(), bytes.end()));
    }
    default:
        return {};
    }
}

std::string reasonOf(const QDBusError& error)
{
    if (error.type() == QDBusError::ServiceUnknown)
        return "it is not running; start it, or name the diagnostic port with --port DEVICE";
    return error.message().toStdString();
}

} // namespace

class ModemManagerClient::Connection final : public QObject
{
    Q_OBJECT

public:
    explicit Connection(Bus which)
        : bus(which == Bus::System ? QDBusConnection::systemBus() : QDBusConnection::sessionBus()),
          serviceWatcher(kService, bus)
    {
        const QString anyPath;
        bus.connect(kService, anyPath, kProperties, QStringLiteral("PropertiesChanged"), this,
                    SLOT(tellChanged()));
        bus.connect(kService, kPath, kObjectManager, QStringLiteral("InterfacesAdded"), this,
                    SLOT(tellChanged()));
        bus.connect(kService, kPath, kObjectManager, QStringLiteral("InterfacesRemoved"), this,
                    SLOT(tellChanged()));
        QObject::connect(&serviceWatcher, &QDBusServiceWatcher::serviceOwnerChanged, this,
                         &Connection::tellChanged);
    }

    void ask(Answer answer)
    {
        if (!bus.isConnected()) {
            queue.async([answer = std::move(answer)] {
                answer({}, "there is no bus to reach it by; name the diagnostic port with --port "
                           "DEVICE");
            });
            return;
        }
        const QDBusMessage question = QDBusMessage::createMethodCall(
            kService, kPath, kObjectManager, QStringLiteral("GetManagedObjects"));
        auto* call = new QDBusPendingCallWatcher(bus.asyncCall(question, kAnswerTimeMs), this);
        QObject::connect(call, &QDBusPendingCallWatcher::finished, this,
                         [call, answer = std::move(answer)] {
                             call->deleteLater();
                             const QDBusMessage reply = call->reply();
                             if (call->isError())
                                 answer({}, reasonOf(call->error()));
                             else
                                 answer(valueOf(reply.arguments().value(0), 0), "");
                         });
    }

    std::function<void()> changed;

public slots:
    void tellChanged()
    {
        if (changed)
            changed();
    }

private:
    QDBusConnection bus;
    QDBusServiceWatcher serviceWatcher;
    QtMainQueue queue;
};

ModemManagerClient::ModemManagerClient(Bus bus) : _connection(std::make_unique<Connection>(bus)) {}

ModemManagerClient::~ModemManagerClient() = default;

void ModemManagerClient::ask(Answer answer) { _connection->ask(std::move(answer)); }

void ModemManagerClient::setChangedCallback(std::function<void()> callback)
{
    _connection->changed = std::move(callback);
}

} // namespace orvane

#include "ModemManagerClient.moc"
