#pragma once

#include "platform/base/Bytes.h"

#include <cstdint>
#include <memory>
#include <string>

namespace orvane
{

// A file that grows by whole blocks. The operations return 0, or an errno that says what went
// wrong.
class BlockFile
{
public:
    virtual ~BlockFile() = default;
    // Writes the block at the end of the file, at once. If that fails, the part that was written is
    // removed again, so that the file ends with the block before.
    virtual int append(ByteView block) = 0;
    // Waits until everything that was appended is safe from a power cut. ENOENT if the file has
    // been deleted or replaced since it was made.
    virtual int synchronise() = 0;
    // Whether blocks wait for the reader of a pipe. synchronise() writes what the pipe takes by
    // now.
    [[nodiscard]] virtual bool isBehind() const { return false; }
};

// A file on disk, or a device or a named pipe. Blocks that a full pipe does not take are kept in
// memory, up to kMostWaitingBytes; with more the reader is too slow, and append() fails.
class DiskBlockFile final : public BlockFile
{
public:
    enum class Existing { Refused, Overwritten };
    static constexpr std::size_t kMostWaitingBytes = 16U << 20;

    // Null if the file cannot be made, or exists and may not be overwritten; `error` then says so
    // and what to do.
    static std::unique_ptr<DiskBlockFile> create(const std::string& path, Existing existing,
                                                 std::string& error);
    // What still waits for the reader of a pipe is lost.
    ~DiskBlockFile() override;
    DiskBlockFile(const DiskBlockFile&) = delete;
    DiskBlockFile& operator=(const DiskBlockFile&) = delete;

    int append(ByteView block) override;
    int synchronise() override;
    [[nodiscard]] bool isBehind() const override { return !_waiting.empty(); }

private:
    explicit DiskBlockFile(int descriptor) : _descriptor(descriptor) {}
    int write(ByteView& rest);
    int writeWaiting();

    int _descriptor;
    std::int64_t _length = 0; // of the whole blocks
    Bytes _waiting;           // for the reader of a pipe
};

} // namespace orvane
