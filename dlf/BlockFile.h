#pragma once

#include "platform/base/Bytes.h"

#include <cstdint>
#include <memory>
#include <string>

namespace orvane
{

// A file that grows by whole blocks. The operations return 0, or what went wrong as an errno.
class BlockFile
{
public:
    virtual ~BlockFile() = default;
    // Writes the block at the file's end, at once. Where that fails, what was written of it is
    // taken back, so that the file ends with the block before.
    virtual int append(ByteView block) = 0;
    // Waits until all that was appended is safe from a power cut.
    virtual int synchronise() = 0;
};

// A file on disk.
class DiskBlockFile final : public BlockFile
{
public:
    enum class Existing { Refused, Overwritten };

    // Null where the file cannot be made, or is there and may not be overwritten; `error` then says
    // so and what to do.
    static std::unique_ptr<DiskBlockFile> create(const std::string& path, Existing existing,
                                                 std::string& error);
    ~DiskBlockFile() override;
    DiskBlockFile(const DiskBlockFile&) = delete;
    DiskBlockFile& operator=(const DiskBlockFile&) = delete;

    int append(ByteView block) override;
    int synchronise() override;

private:
    explicit DiskBlockFile(int descriptor) : _descriptor(descriptor) {}

    int _descriptor;
    std::int64_t _length = 0; // of the whole blocks
};

} // namespace orvane
