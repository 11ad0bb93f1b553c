#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <sys/types.h>

namespace orvane
{

// A directory in which named ports live, and who may use them.
//
// A private directory belongs to the effective user and has exactly the mode 0700. A shared one
// belongs to the user named "telephonyd" and has exactly the mode 1770: its group may have ports in
// it, and the sticky bit protects each member's own.
class PortsDirectory
{
public:
    static constexpr const char* kSharedOwnerName = "telephonyd";
    // Where a telephony server of the system has its ports.
    static constexpr const char* kSystemPath = "/run/telephonyd";

    // The directory `option` (the value of --ports; empty = not given), else $ORVANE_PORTS, else
    // $XDG_RUNTIME_DIR/telephony, else /tmp/telephony-UID. A missing one is created with mode 0700,
    // for the first two with its parents. An empty variable counts as not set, and so does an
    // $XDG_RUNTIME_DIR that is not absolute.
    //
    // Returns nullopt, with one line in `error` that says what is wrong, when the directory cannot
    // be made or trusted.
    static std::optional<PortsDirectory> open(std::string_view option, std::string& error);
    // Whether open() takes a directory that the user named, by option or variable. Otherwise a
    // viewer also looks for a server in kSystemPath.
    static bool isNamed(std::string_view option);

    // A directory that exists, if it can be trusted: see above. Each symbolic link of the path must
    // belong to the effective user or to root. `sharedOwner` is the user that may own a shared
    // directory, nullopt where the system has none.
    static std::optional<PortsDirectory> existing(std::string path, std::string& error,
                                                  std::optional<uid_t> sharedOwner);
    // The user id of "telephonyd"; nullopt where there is no such user.
    static std::optional<uid_t> systemSharedOwner();
    // A private directory at a path that nobody checks.
    static PortsDirectory unchecked(std::string path);

    [[nodiscard]] const std::string& path() const { return _path; }
    [[nodiscard]] std::string pathOf(const std::string& port) const { return _path + '/' + port; }
    [[nodiscard]] bool isShared() const { return _isShared; }
    [[nodiscard]] uid_t owner() const { return _owner; }
    // Of a shared directory: the group whose members may use it.
    [[nodiscard]] gid_t group() const { return _group; }
    // Whether the effective user owns the directory.
    [[nodiscard]] bool isOwn() const;

    // Whether a process of that user and those groups may be at the other end of a connection: the
    // effective user, root, the directory's owner, and in a shared directory of the own user each
    // member of its group.
    [[nodiscard]] bool accepts(uid_t user, gid_t primaryGroup) const;
    [[nodiscard]] bool acceptsGroup(gid_t group) const;

private:
    PortsDirectory(std::string path, bool isShared, uid_t owner, gid_t group)
        : _path(std::move(path)), _isShared(isShared), _owner(owner), _group(group)
    {
    }

    std::string _path;
    bool _isShared;
    uid_t _owner;
    gid_t _group;
};

} // namespace orvane
