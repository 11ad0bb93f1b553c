#pragma once

#include <cstdint>
#include <cstdio>
#include <memory>
#include <optional>
#include <string>
#include <string_view>

namespace orvane
{

// Texts and numbers that are put aside on disk while a recording is read, and read again in the
// order in which they were written. The file has no name: it is below the system's temporary
// directory and disappears with the spool or the program.
class RowSpool
{
public:
    RowSpool();

    // 0, or the errno of what went wrong first. After that nothing is written or read any more.
    [[nodiscard]] int error() const { return _error; }

    void putNumber(std::uint32_t number);
    void putText(std::string_view text);

    // From now on it is read, from its start.
    void rewind();
    // Nothing at the end, or after an error.
    std::optional<std::uint32_t> number();
    // False likewise.
    bool text(std::string& to);

private:
    struct Closer {
        void operator()(std::FILE* file) const { std::fclose(file); }
    };

    void put(const void* bytes, std::size_t count);
    bool get(void* bytes, std::size_t count);
    void noteError();

    std::unique_ptr<std::FILE, Closer> _file;
    int _error = 0;
};

} // namespace orvane
