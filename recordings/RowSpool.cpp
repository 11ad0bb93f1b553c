#include "recordings/RowSpool.h"

#include <cerrno>
#include <cstdlib>
#include <filesystem>
#include <unistd.h>

namespace orvane
{

RowSpool::RowSpool()
{
    std::error_code noDirectory;
    const std::filesystem::path directory = std::filesystem::temp_directory_path(noDirectory);
    std::string path = (noDirectory ? "/tmp" : directory) / "orvane-export-XXXXXX";
    const int descriptor = ::mkstemp(path.data());
    if (descriptor < 0) {
        _error = errno;
        return;
    }
    ::unlink(path.c_str());
    _file.reset(::fdopen(descriptor, "w+b"));
    if (!_file) {
        _error = errno;
        ::close(descriptor);
    }
}

void RowSpool::putNumber(std::uint32_t number) { put(&number, sizeof number); }

void RowSpool::putText(std::string_view text)
{
    putNumber(static_cast<std::uint32_t>(text.size()));
    put(text.data(), text.size());
}

void RowSpool::rewind()
{
    // What is still buffered is written here, so that a full disk may show only now.
    if (_error == 0 && std::fseek(_file.get(), 0, SEEK_SET) != 0)
        noteError();
}

std::optional<std::uint32_t> RowSpool::number()
{
    std::uint32_t number = 0;
    return get(&number, sizeof number) ? std::optional(number) : std::nullopt;
}

bool RowSpool::text(std::string& to)
{
    const auto length = number();
    to.resize(length.value_or(0));
    return length && get(to.data(), to.size());
}

void RowSpool::put(const void* bytes, std::size_t count)
{
    if (_error == 0 && std::fwrite(bytes, 1, count, _file.get()) != count)
        noteError();
}

bool RowSpool::get(void* bytes, std::size_t count)
{
    if (_error != 0)
        return false;
    if (std::fread(bytes, 1, count, _file.get()) == count)
        return true;
    if (std::ferror(_file.get()) != 0)
        noteError();
    return false;
}

void RowSpool::noteError() { _error = errno != 0 ? errno : EIO; }

} // namespace orvane
