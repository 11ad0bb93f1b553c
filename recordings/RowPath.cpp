#include "recordings/RowPath.h"

#include "platform/base/ArrayLock.h"
#include "ui/tree/DisplayWalk.h"
#include "ui/tree/OrvaneModelNode.h"

#include <optional>

namespace orvane
{

namespace
{

constexpr std::string_view kAnyName = "/*";

// Whether the rest of a path goes on with the step: "/Name" or "/Name/...".
bool goesOnWith(std::string_view rest, std::string_view step)
{
    return rest.starts_with(step) && (rest.size() == step.size() || rest[step.size()] == '/');
}

// The rest of a path below the child of that name; nothing where it leads elsewhere.
std::optional<std::string_view> restBelow(std::string_view rest, std::string_view name)
{
    if (goesOnWith(rest, kAnyName))
        return rest.substr(kAnyName.size());
    if (name.empty())
        return rest;
    if (goesOnWith(rest.substr(1), name))
        return rest.substr(1 + name.size());
    return std::nullopt;
}

// A name as it is part of a path; `storage` is used where the two differ.
std::string_view partOfPath(std::string_view name, std::string& storage)
{
    if (name.find('/') == std::string_view::npos)
        return name;
    storage = pathByAppending("", name);
    return std::string_view(storage).substr(1);
}

class Walk
{
public:
    explicit Walk(const RowVisitor& visit) : _visit(visit) {}

    // The rows of the value at the current path that the rest of a path stands for.
    void visit(const PropertyValue& value, std::string_view rest)
    {
        if (!isDisplayGroup(value)) {
            if (rest.empty())
                _visit(_path, value);
            return;
        }
        forEachDisplayChild(value, [&](std::string_view childName, const PropertyValue& child) {
            std::string storage;
            const std::string_view name = partOfPath(childName, storage);
            const auto below = rest.empty() ? rest : restBelow(rest, name);
            if (!below)
                return;
            const std::size_t length = _path.size();
            if (!name.empty())
                (_path += '/') += name;
            if (_path.size() <= RowPath::kLongest)
                visit(child, *below);
            _path.resize(length);
        });
    }

private:
    const RowVisitor& _visit;
    std::string _path;
};

} // namespace

RowPath::RowPath(std::string_view text) : _text(pathByAppending("", text)) {}

bool RowPath::isPattern() const
{
    for (std::size_t at = _text.find(kAnyName); at != _text.npos; at = _text.find(kAnyName, at + 1))
        if (goesOnWith(std::string_view(_text).substr(at), kAnyName))
            return true;
    return false;
}

void RowPath::forEachRow(const PropertyValue& display, const RowVisitor& visit) const
{
    const ArrayLock::Guard guard;
    const bool isEverything = _text.size() == 1;
    Walk(visit).visit(display, isEverything ? std::string_view() : std::string_view(_text));
}

} // namespace orvane
