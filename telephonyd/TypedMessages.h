#pragma once

#include "platform/base/Bytes.h"
#include "platform/services/MainQueue.h"
#include "telephonyd/phone/LogSource.h"

#include <cstdint>
#include <deque>
#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace orvane
{

// A log message as a person writes it in one line.
struct TypedMessage {
    // Log codes from here on number the items that the server makes itself.
    static constexpr std::uint32_t kServerItems = 0xFF0000;

    std::uint32_t code = 0; // 0 to 0xFFFF, or kServerItems plus the item's number
    Bytes payload;          // what follows the message's header: its first byte has the offset 13
};

// "CODE BYTES": the code in decimal or, behind "0x", hexadecimal; the payload in hexadecimal, with
// blanks between bytes where one likes. Without a message `error` says what is wrong; an empty line
// and a line that begins with '#' yield neither.
struct TypedLine {
    std::optional<TypedMessage> message;
    std::string error;
};
TypedLine parseTypedLine(std::string_view line);

// Log messages that a person types, for trying out a decoder without a phone.
//
// Every channel gets the messages whose codes it asks for: those typed so far when it starts, later
// ones as they come.
class TypedMessages
{
public:
    // Bytes of payload kept for channels that start later; above that the oldest message goes.
    static constexpr std::size_t kKeptBytes = std::size_t{1024} * 1024;
    // What became of a line or message, in one line without newline.
    using Tell = std::function<void(const std::string& text)>;

    // `technology` is the constant. The queue is not owned; it must outlive this and all sources.
    TypedMessages(std::string technology, MainQueue& queue, Tell tell);
    TypedMessages(const TypedMessages&) = delete;
    TypedMessages& operator=(const TypedMessages&) = delete;

    void take(std::string_view line);
    // Makes the sources of channels. They may outlive this, and are then silent.
    [[nodiscard]] LogSourceFactory sources() const;

private:
    class Source;
    struct Shared;

    std::shared_ptr<Shared> _shared;
};

} // namespace orvane
