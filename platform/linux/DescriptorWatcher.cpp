#include "platform/linux/DescriptorWatcher.h"

#include <QSocketNotifier>

namespace orvane
{

struct DescriptorWatcher::Notifier {
    QSocketNotifier notifier;
};

DescriptorWatcher::DescriptorWatcher(int descriptor, For what, std::function<void()> callback)
    : _notifier(new Notifier{QSocketNotifier(
          descriptor, what == For::Reading ? QSocketNotifier::Read : QSocketNotifier::Write)})
{
    // The connection holds the callback until it has returned: it may destroy the notifier.
    QObject::connect(&_notifier->notifier, &QSocketNotifier::activated, &_notifier->notifier,
                     std::move(callback));
}

DescriptorWatcher::~DescriptorWatcher() = default;

void DescriptorWatcher::setEnabled(bool enabled) { _notifier->notifier.setEnabled(enabled); }

} // namespace orvane
