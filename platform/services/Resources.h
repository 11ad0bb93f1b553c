#pragma once

#include "platform/base/Bytes.h"

#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace orvane
{

// The application's resources: templates and interface files, by name and type ("LTE", "plist").
class Resources
{
public:
    virtual ~Resources() = default;
    // The content of the resource, or nothing when there is none of that name and type.
    [[nodiscard]] virtual std::optional<Bytes> load(std::string_view name,
                                                    std::string_view type) const = 0;
    // The paths of all resources of the type, sorted.
    [[nodiscard]] virtual std::vector<std::string> pathsOfType(std::string_view type) const = 0;
};

// Files "NAME.TYPE" in one directory.
class DirectoryResources final : public Resources
{
public:
    explicit DirectoryResources(std::string directory) : _directory(std::move(directory)) {}
    [[nodiscard]] std::optional<Bytes> load(std::string_view name,
                                            std::string_view type) const override;
    [[nodiscard]] std::vector<std::string> pathsOfType(std::string_view type) const override;

private:
    std::string _directory;
};

} // namespace orvane
