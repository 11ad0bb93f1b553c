#include "app/OrvaneModel.h"

#include "LogGenerator/MessageTime.h"
#include "LogGenerator/StateKeys.h"
#include "platform/base/Bytes.h"
#include "platform/base/PropertyValue.h"
#include "platform/services/Services.h"

#include <cmath>
#include <exception>
#include <typeinfo>
#include <utility>

namespace orvane
{

OrvaneModel::OrvaneModel(ModelEnvironment environment, ModelObserver* observer)
    : _environment(std::move(environment)), _observer(observer),
      _state(std::make_shared<PropertyDictionary>())
{
}

OrvaneModel::~OrvaneModel() { destroyPorts(); }

NodePointer OrvaneModel::topLevelNodes()
{
    if (_nodes || !_logGenerator)
        return _nodes;
    const PropertyValue display = _logGenerator->generateLogUsingState(*_state);
    PathDictionary paths;
    _nodes = OrvaneModelNode::makeTreeFromObject(display, paths);
    _nodesByPath = std::move(paths);
    return _nodes;
}

NodePointer OrvaneModel::nodeAtPath(const std::string& path)
{
    if (!_nodesByPath)
        topLevelNodes();
    return _nodesByPath ? _nodesByPath->at(path) : nullptr;
}

void OrvaneModel::updateWithData(ByteView data)
{
    if (_environment.channelObserver)
        _environment.channelObserver->messageReceived(data);
    if (_logGenerator) {
        const double now = Services::current().clock().secondsSince1970();
        const MessageTime arrival(static_cast<std::int64_t>(std::floor(now * 1000)));
        _logGenerator->updateState(*_state, data);
    }
    _updated = true;
}

void OrvaneModel::refresh()
{
    checkHealth();
    if (!_updated)
        return;
    _updated = false;
    _nodes = nullptr;
    _nodesByPath.reset();
    _isViewUpdateQueued = true;
    _environment.queue.async([weak = weak_from_this()] {
        const auto model = weak.lock();
        if (!model)
            return;
        model->_isViewUpdateQueued = false;
        if (!model->_observer)
            return;
        // This generates the display from a template, which may be bad.
        try {
            model->_observer->updateViewControllerFromModel();
        } catch (const std::exception& failure) {
            logError("The display cannot be shown: %s", failure.what());
        }
    });
}

PropertyValue OrvaneModel::getSaveContents()
{
    return _logGenerator ? _logGenerator->getSaveContentsFromState(*_state)
                         : LogGenerator::historyOf(*_state);
}

// The tree on the screen stays until a new generator has taken a message. A refresh may have
// dropped it for a view update that has not run yet; then it must be made again now.
void OrvaneModel::keepTreeForQueuedUpdate()
{
    if (!_isViewUpdateQueued)
        return;
    try {
        topLevelNodes();
    } catch (const std::exception& failure) {
        logError("The display cannot be shown: %s", failure.what());
    }
}

// A display belongs to one generator: a new one starts with a state of its own, or its sections
// would have nothing to write into. Only the history is kept, and only for a generator of the same
// class.
void OrvaneModel::adoptGenerator(std::unique_ptr<LogGenerator> generator)
{
    keepTreeForQueuedUpdate();
    if (generator) {
        LogGenerator& adopted = *generator;
        const std::type_index generatorClass = typeid(adopted);
        const PropertyValue history = (*_state)[kHistoryKey];
        _state = std::make_shared<PropertyDictionary>();
        if (history && _historyClass == generatorClass)
            _state->set(kHistoryKey, history);
        _historyClass = generatorClass;
        _updated = false;
    }
    _logGenerator = std::move(generator);
}

} // namespace orvane
