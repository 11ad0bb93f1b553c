#pragma once

#include "platform/base/PacketView.h"
#include "platform/services/ByteDevice.h"
#include "platform/services/MainQueue.h"
#include "telephonyd/modem/DiagnosticFrame.h"

#include <algorithm>
#include <array>
#include <map>
#include <optional>
#include <set>
#include <string>
#include <vector>

namespace orvane
{

// A modem behind a diagnostic port in memory. It answers at once, from the queue, unless a test
// tells it otherwise, and sends the items that a test gives it if their code is switched on.
class MemoryModem
{
public:
    // How it treats a request.
    enum class Manner { Answer, Ignore, RefuseCommand, NotNow, FailedStatus };

    explicit MemoryModem(MainQueue& queue) : _queue(queue) { ranges.fill(0x1000); }

    // What opens its port. The modem must outlive the device.
    OpenByteDevice opener()
    {
        return [this](std::string& error) -> std::unique_ptr<ByteDevice> {
            ++openings;
            if (!isPluggedIn) {
                error = "cannot open the port: it is absent";
                return nullptr;
            }
            return std::make_unique<Device>(*this);
        };
    }

    void unplug(const std::string& reason = "it was unplugged")
    {
        isPluggedIn = false;
        codes.clear();
        if (_device && _device->closed)
            _device->closed(reason);
    }
    void plugIn() { isPluggedIn = true; }
    [[nodiscard]] bool isOpen() const { return _device != nullptr; }

    // Raw bytes, as they come.
    void send(ByteView bytes)
    {
        if (_device && _device->received)
            _device->received(bytes);
    }
    void sendPayload(ByteView payload)
    {
        Bytes frame;
        appendDiagnosticFrame(frame, payload);
        send(frame);
    }
    static Bytes item(std::uint16_t code, const Bytes& payload = {1, 2, 3})
    {
        Bytes item(12, 0);
        item[0] = static_cast<std::uint8_t>(12 + payload.size());
        item[2] = static_cast<std::uint8_t>(code & 0xFF);
        item[3] = static_cast<std::uint8_t>(code >> 8);
        item[6] = 7; // some timestamp
        item.insert(item.end(), payload.begin(), payload.end());
        return item;
    }
    // An item whatever is switched on.
    void sendItem(std::uint16_t code)
    {
        const Bytes bytes = item(code);
        Bytes payload = {0x10, 0, bytes[0], bytes[1]};
        payload.insert(payload.end(), bytes.begin(), bytes.end());
        sendPayload(payload);
    }
    // An item if its code is switched on; returns whether it is.
    bool logItem(std::uint16_t code)
    {
        const bool isOn = codes.contains(code);
        if (isOn)
            sendItem(code);
        return isOn;
    }

    bool isPluggedIn = true;
    int openings = 0;
    std::set<std::uint16_t> codes;               // switched on
    std::vector<Bytes> requests;                 // payloads, in order
    std::map<std::uint32_t, Manner> manners;     // by operation (0 off, 1 ranges, 3 mask)
    Manner greeting = Manner::Answer;            // of "who are you"
    std::array<std::uint32_t, 16> ranges{};      // codes by group
    std::function<void(const Bytes&)> onRequest; // before it is answered

private:
    struct Device final : ByteDevice {
        explicit Device(MemoryModem& itsModem) : modem(itsModem) { modem._device = this; }
        ~Device() override
        {
            if (modem._device == this)
                modem._device = nullptr;
        }
        Device(const Device&) = delete;
        Device& operator=(const Device&) = delete;
        void setCallbacks(ReceivedCallback newReceived, ClosedCallback newClosed) override
        {
            received = std::move(newReceived);
            closed = std::move(newClosed);
        }
        void write(ByteView bytes) override
        {
            reader.append(bytes);
            while (const auto payload = reader.next())
                modem.take(Bytes(payload->begin(), payload->end()));
        }
        MemoryModem& modem;
        DiagnosticFrameReader reader;
        ReceivedCallback received;
        ClosedCallback closed;
    };

    static std::uint32_t word(const Bytes& payload, std::size_t offset)
    {
        return static_cast<std::uint32_t>(PacketView(payload).unsignedAt(offset, 4).value_or(0));
    }
    static void append32(Bytes& bytes, std::uint32_t value)
    {
        for (unsigned shift = 0; shift < 32; shift += 8)
            bytes.push_back(static_cast<std::uint8_t>(value >> shift));
    }

    void take(const Bytes& payload)
    {
        requests.push_back(payload);
        if (onRequest)
            onRequest(payload);
        const bool isGreeting = payload[0] == 0;
        const auto found = manners.find(word(payload, 4));
        const Manner manner = isGreeting               ? greeting
                              : found == manners.end() ? Manner::Answer
                                                       : found->second;
        if (manner == Manner::Ignore)
            return;
        Bytes reply = manner == Manner::RefuseCommand ? refusal(0x13, payload)
                      : manner == Manner::NotNow      ? refusal(0x18, payload)
                                                      : answerTo(payload, manner);
        // A reply of a modem that is unplugged meanwhile is lost.
        _queue.async([this, reply] {
            if (_device)
                sendPayload(reply);
        });
    }

    static Bytes refusal(std::uint8_t reason, const Bytes& payload)
    {
        Bytes reply = {reason};
        reply.insert(reply.end(), payload.begin(), payload.end());
        return reply;
    }

    Bytes answerTo(const Bytes& payload, Manner manner)
    {
        if (payload[0] == 0)
            return {0, 'A', 'p', 'r'};
        const std::uint32_t status = manner == Manner::FailedStatus ? 1 : 0;
        Bytes reply(payload.begin(), payload.begin() + 8);
        append32(reply, status);
        switch (word(payload, 4)) {
        case 0:
            if (status == 0)
                codes.clear();
            break;
        case 1:
            for (const std::uint32_t range : ranges)
                append32(reply, range);
            break;
        default:
            if (status == 0)
                setMask(payload);
            reply.insert(reply.end(), payload.begin() + 8, payload.end());
        }
        return reply;
    }

    void setMask(const Bytes& payload)
    {
        const std::uint32_t group = word(payload, 8);
        std::erase_if(codes, [group](std::uint16_t code) { return code >> 12 == group; });
        for (std::uint32_t place = 0; place < word(payload, 12); ++place)
            if ((payload.at(16 + place / 8) >> place % 8 & 1) != 0)
                codes.insert(static_cast<std::uint16_t>(group << 12 | place));
    }

    MainQueue& _queue;
    Device* _device = nullptr;
};

} // namespace orvane
