// Lines as a person types them, to one viewer that asks for some codes: every line is told in at
// most one line, and the viewer gets whole messages with the right lengths.

#include "doubles/ManualMainQueue.h"
#include "telephonyd/TypedMessages.h"

#include <cstdlib>

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    using namespace orvane;
    ManualMainQueue queue;
    std::size_t told = 0;
    TypedMessages messages("a technology", queue, [&told](const std::string& text) {
        ++told;
        for (const char character : text)
            if (character < ' ' || character > '~')
                std::abort();
    });
    const auto source = messages.sources()();
    source->start(
        {
            {0xB0C2, 45249},
            {0,      2    }
    },
        [](ByteView message) {
            if (message.size() < 13 ||
                static_cast<std::size_t>(message[1] | message[2] << 8) != message.size() - 1)
                std::abort();
            return true;
        });
    queue.runPending();
    std::string_view text(reinterpret_cast<const char*>(data), size);
    while (!text.empty()) {
        const std::size_t end = text.find('\n');
        const std::size_t toldBefore = told;
        messages.take(text.substr(0, end));
        if (told > toldBefore + 1)
            std::abort();
        text.remove_prefix(end == std::string_view::npos ? text.size() : end + 1);
    }
    return 0;
}
