#include "telephonyd/TypedMessages.h"

#include "platform/services/Lifetime.h"
#include "platform/services/Services.h"
#include "telephonyd/phone/PacketWriter.h"
#include "telephonyd/phone/PhoneSource.h"

#include <algorithm>
#include <charconv>
#include <cstdio>
#include <utility>

namespace orvane
{

namespace
{

constexpr std::string_view kBlanks = " \t\r";
constexpr std::uint32_t kLastModemCode = 0xFFFF;
constexpr std::uint32_t kItemHeaderBytes = 12; // length, code and timestamp
constexpr std::size_t kLongestPayload = 0xFFFF - kItemHeaderBytes;
constexpr std::uint8_t kModemItem = 1;
constexpr std::uint8_t kServerItem = 0xFF;

std::string_view withoutBlanks(std::string_view text)
{
    const std::size_t first = text.find_first_not_of(kBlanks);
    if (first == std::string_view::npos)
        return {};
    return text.substr(first, text.find_last_not_of(kBlanks) - first + 1);
}

std::optional<std::uint32_t> wholeNumber(std::string_view digits, int base)
{
    std::uint32_t number = 0;
    const char* end = digits.data() + digits.size();
    const auto [stopped, error] = std::from_chars(digits.data(), end, number, base);
    if (error != std::errc() || stopped != end)
        return std::nullopt;
    return number;
}

std::optional<std::uint32_t> logCode(std::string_view word)
{
    const bool isHexadecimal = word.starts_with("0x") || word.starts_with("0X");
    const auto code = isHexadecimal ? wholeNumber(word.substr(2), 16) : wholeNumber(word, 10);
    if (!code || *code > TypedMessage::kServerItems + kLastModemCode ||
        (*code > kLastModemCode && *code < TypedMessage::kServerItems))
        return std::nullopt;
    return code;
}

std::string codeText(std::uint32_t code)
{
    char text[16];
    std::snprintf(text, sizeof text, "0x%04X", code);
    return text;
}

bool isWanted(const LogSelection& selection, std::uint32_t code)
{
    return code >= TypedMessage::kServerItems
               ? selection.extraCodes.contains(code - TypedMessage::kServerItems)
               : selection.modemCodes.contains(code);
}

Bytes logMessage(const TypedMessage& message)
{
    const bool isServerItem = message.code >= TypedMessage::kServerItems;
    const std::uint64_t timestamp = logTimestamp(Services::current().clock().secondsSince1970());
    PacketWriter writer;
    writer.put8(isServerItem ? kServerItem : kModemItem)
        .put16(kItemHeaderBytes + static_cast<std::uint32_t>(message.payload.size()))
        .put16(message.code & kLastModemCode)
        .put32(static_cast<std::uint32_t>(timestamp & 0xFFFFFFFF))
        .put32(static_cast<std::uint32_t>(timestamp >> 32))
        .append(message.payload);
    return writer.take();
}

// The word as part of a line for a terminal: cut, and without control characters.
std::string quoted(std::string_view word)
{
    constexpr std::size_t kLongest = 40;
    std::string text(word.substr(0, kLongest));
    for (char& character : text)
        if (character < ' ' || character > '~')
            character = '?';
    return "\"" + text + "\"";
}

std::string countOfViewers(std::size_t count)
{
    return count == 1 ? "1 viewer" : std::to_string(count) + " viewers";
}

} // namespace

TypedLine parseTypedLine(std::string_view line)
{
    line = withoutBlanks(line);
    if (line.empty() || line.front() == '#')
        return {};
    const std::string_view word = line.substr(0, line.find_first_of(kBlanks));
    const auto code = logCode(word);
    if (!code)
        return {{},
                "a line begins with a log code such as 0xB0C2 (at most 0xFFFF, or 0xFF0000 plus "
                "the number of a server's item), not with " +
                    quoted(word)};
    TypedMessage message{*code, {}};
    std::string_view rest = withoutBlanks(line.substr(word.size()));
    while (!rest.empty()) {
        const auto byte = rest.size() >= 2 ? wholeNumber(rest.substr(0, 2), 16) : std::nullopt;
        if (!byte)
            return {{},
                    "a byte is two hexadecimal digits, not " +
                        quoted(rest.substr(0, rest.find_first_of(kBlanks)))};
        message.payload.push_back(static_cast<std::uint8_t>(*byte));
        rest = withoutBlanks(rest.substr(2));
    }
    if (message.payload.size() > kLongestPayload)
        return {{}, "a message has at most " + std::to_string(kLongestPayload) + " bytes"};
    return {std::move(message), {}};
}

// What the typed messages and the sources of all channels share.
struct TypedMessages::Shared {
    std::string technology;
    MainQueue& queue;
    Tell tell;
    std::deque<TypedMessage> kept = {};
    std::size_t keptBytes = 0;
    std::vector<Source*> started = {}; // each removes itself at its end

    void keep(TypedMessage message)
    {
        keptBytes += message.payload.size();
        kept.push_back(std::move(message));
        while (keptBytes > kKeptBytes || kept.size() > kKeptBytes) {
            keptBytes -= kept.front().payload.size();
            kept.pop_front();
        }
    }
};

// The messages of one channel.
class TypedMessages::Source final : public LogSource
{
public:
    explicit Source(const std::shared_ptr<Shared>& shared)
        : _technology(shared->technology), _shared(shared)
    {
    }
    ~Source() override
    {
        if (const auto shared = _shared.lock())
            std::erase(shared->started, this);
    }
    Source(const Source&) = delete;
    Source& operator=(const Source&) = delete;

    [[nodiscard]] std::string technology() const override { return _technology; }

    void start(const LogSelection& selection, Send send) override
    {
        _selection = selection;
        _send = std::move(send);
        if (const auto shared = _shared.lock())
            shared->queue.async(_lifetime.whileAlive([this] { sendKept(); }));
    }

    // Returns whether the channel asks for the message's code.
    bool take(const TypedMessage& message)
    {
        if (!isWanted(_selection, message.code))
            return false;
        // Messages come as slowly as a person types, so a client that is behind gets them, too.
        _send(logMessage(message));
        return true;
    }

private:
    void sendKept()
    {
        const auto shared = _shared.lock();
        if (!shared)
            return;
        shared->started.push_back(this);
        shared->tell("a viewer has started");
        for (const TypedMessage& message : shared->kept)
            shared->tell(
                codeText(message.code) +
                (take(message) ? ": sent to it" : ": not sent, it does not ask for this code"));
    }

    std::string _technology;
    std::weak_ptr<Shared> _shared;
    LogSelection _selection;
    Send _send;
    Lifetime _lifetime;
};

TypedMessages::TypedMessages(std::string technology, MainQueue& queue, Tell tell)
    : _shared(std::make_shared<Shared>(Shared{std::move(technology), queue, std::move(tell)}))
{
}

void TypedMessages::take(std::string_view line)
{
    TypedLine typed = parseTypedLine(line);
    if (!typed.message) {
        if (!typed.error.empty())
            _shared->tell(typed.error);
        return;
    }
    const std::uint32_t code = typed.message->code;
    std::size_t sent = 0;
    for (Source* source : _shared->started)
        sent += source->take(*typed.message) ? 1 : 0;
    _shared->keep(*std::move(typed.message));
    std::string told = codeText(code);
    if (sent != 0)
        told += ": sent to " + countOfViewers(sent);
    else if (_shared->started.empty())
        told += ": kept for the first viewer that starts";
    else
        told += ": not sent, no viewer asks for this code";
    _shared->tell(told);
}

LogSourceFactory TypedMessages::sources() const
{
    return [shared = _shared] { return std::make_unique<Source>(shared); };
}

} // namespace orvane
