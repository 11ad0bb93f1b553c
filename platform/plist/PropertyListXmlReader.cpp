#include "platform/plist/PropertyListXmlReader.h"

#include "platform/base/Bytes.h"
#include "platform/plist/PropertyListText.h"
#include "platform/plist/PropertyListXmlBuilder.h"

#include <algorithm>
#include <expat.h>
#include <memory>
#include <new>
#include <type_traits>

namespace orvane
{

namespace
{

// Every declared attribute costs time on every element, so a DTD may not declare many.
constexpr int kDeclaredAttributesLimit = 64;

// Expat counts in int.
constexpr std::size_t kPieceBytes = std::size_t{1} << 30;

struct ParserDeleter {
    void operator()(XML_Parser parser) const { XML_ParserFree(parser); }
};

// One run of Expat over one text. Expat calls back for what it finds; the first fault stops it.
class XmlRun
{
public:
    // `encoding` is the text's encoding, or null where the XML declaration decides.
    XmlRun(std::string_view text, const char* encoding);
    PropertyListResult read();

private:
    void setHandlers();
    template <typename Action>
    static void guard(void* self, Action action);
    void fail(std::string what, std::size_t at);
    void failHere(const char* what) { fail(what, here()); }
    void failWithExpatError();
    [[nodiscard]] std::size_t here() const;
    [[nodiscard]] std::string position(std::size_t at) const;

    std::string_view _text;
    std::unique_ptr<std::remove_pointer_t<XML_Parser>, ParserDeleter> _parser;
    PropertyListXmlBuilder _builder;
    std::size_t _lastStart = 0; // offset of the element that was started last
    std::string _declaredEncoding;
    int _declaredAttributes = 0;
    std::string _error;
};

XmlRun::XmlRun(std::string_view text, const char* encoding)
    : _text(text), _parser(XML_ParserCreate(encoding)), _builder(text.size())
{
    if (!_parser)
        throw std::bad_alloc();
}

// No exception may pass through Expat. It may still call back after it has been stopped.
template <typename Action>
void XmlRun::guard(void* self, Action action)
{
    auto& run = *static_cast<XmlRun*>(self);
    if (!run._error.empty())
        return;
    try {
        action(run);
    } catch (const std::bad_alloc&) {
        run._error = "out of memory"; // short enough to need none
        XML_StopParser(run._parser.get(), XML_FALSE);
    }
}

void XmlRun::setHandlers()
{
    XML_Parser parser = _parser.get();
    XML_SetUserData(parser, this);
    XML_SetElementHandler(
        parser,
        [](void* self, const XML_Char* name, const XML_Char**) {
            guard(self, [name](XmlRun& run) {
                run._lastStart = run.here();
                if (!run._builder.startElement(name))
                    run.fail(run._builder.error(), run._lastStart);
            });
        },
        [](void* self, const XML_Char*) {
            guard(self, [](XmlRun& run) {
                if (!run._builder.endElement())
                    run.fail(run._builder.error(), run._lastStart);
            });
        });
    XML_SetCharacterDataHandler(parser, [](void* self, const XML_Char* text, int length) {
        guard(self, [text, length](XmlRun& run) {
            if (!run._builder.addText(std::string_view(text, static_cast<std::size_t>(length))))
                run.fail(run._builder.error(), run.here());
        });
    });
    XML_SetXmlDeclHandler(parser, [](void* self, const XML_Char*, const XML_Char* encoding, int) {
        guard(self, [encoding](XmlRun& run) { run._declaredEncoding = encoding ? encoding : ""; });
    });
    XML_SetEntityDeclHandler(parser, [](void* self, const XML_Char*, int, const XML_Char*, int,
                                        const XML_Char*, const XML_Char*, const XML_Char*,
                                        const XML_Char*) {
        guard(self, [](XmlRun& run) { run.failHere("entity declarations are not accepted"); });
    });
    XML_SetAttlistDeclHandler(parser, [](void* self, const XML_Char*, const XML_Char*,
                                         const XML_Char*, const XML_Char*, int) {
        guard(self, [](XmlRun& run) {
            if (++run._declaredAttributes > kDeclaredAttributesLimit)
                run.failHere("too many attribute declarations");
        });
    });
    // With an external DTD, which is not loaded, Expat would drop references to unknown entities.
    XML_SetSkippedEntityHandler(parser, [](void* self, const XML_Char*, int) {
        guard(self, [](XmlRun& run) { run.failHere("undefined entity"); });
    });
}

PropertyListResult XmlRun::read()
{
    setHandlers();
    std::string_view rest = _text;
    XML_Status status = XML_STATUS_OK;
    do {
        const std::size_t length = std::min(rest.size(), kPieceBytes);
        const bool isLast = length == rest.size();
        status = XML_Parse(_parser.get(), rest.data(), static_cast<int>(length), isLast);
        rest.remove_prefix(length);
    } while (status == XML_STATUS_OK && !rest.empty());

    if (_error.empty() && status != XML_STATUS_OK)
        failWithExpatError();
    if (!_error.empty())
        return {{}, _error};
    return {_builder.root(), {}};
}

void XmlRun::fail(std::string what, std::size_t at)
{
    _error = std::move(what) + position(at);
    XML_StopParser(_parser.get(), XML_FALSE);
}

void XmlRun::failWithExpatError()
{
    const XML_Error code = XML_GetErrorCode(_parser.get());
    std::string what = XML_ErrorString(code);
    if (code == XML_ERROR_UNKNOWN_ENCODING)
        what += " " + quotedExcerpt(_declaredEncoding);
    fail(std::move(what), here());
}

std::size_t XmlRun::here() const
{
    const XML_Index index = XML_GetCurrentByteIndex(_parser.get());
    return index < 0 ? 0 : static_cast<std::size_t>(index);
}

std::string XmlRun::position(std::size_t at) const
{
    constexpr std::string_view kUtf8Mark = "\xEF\xBB\xBF";
    const std::size_t first = _text.starts_with(kUtf8Mark) ? kUtf8Mark.size() : 0;
    // Of the encodings that Expat knows, only Latin-1 has characters beyond ASCII of one byte.
    const bool isLatin1 = !_declaredEncoding.empty() && (_declaredEncoding[0] | 0x20) == 'i';
    std::size_t line = 1;
    std::size_t column = 1;
    for (std::size_t i = first; i < std::min(at, _text.size()); ++i) {
        const char byte = _text[i];
        const bool endsLine =
            byte == '\n' || (byte == '\r' && !_text.substr(i + 1).starts_with('\n'));
        const bool isContinuation = !isLatin1 && (static_cast<unsigned char>(byte) & 0xC0) == 0x80;
        if (endsLine) {
            ++line;
            column = 1;
        } else if (!isContinuation) {
            ++column;
        }
    }
    return " at line " + std::to_string(line) + ", column " + std::to_string(column);
}

// The byte order of a text in UTF-16, told by a byte-order mark or by a "<" at its start.
std::optional<std::endian> utf16Order(ByteView bytes)
{
    if (bytes.size() < 2)
        return std::nullopt;
    if ((bytes[0] == 0xFE && bytes[1] == 0xFF) || (bytes[0] == 0 && bytes[1] == '<'))
        return std::endian::big;
    if ((bytes[0] == 0xFF && bytes[1] == 0xFE) || (bytes[0] == '<' && bytes[1] == 0))
        return std::endian::little;
    return std::nullopt;
}

} // namespace

PropertyListResult readXmlPropertyList(ByteView bytes)
{
    const std::optional<std::endian> order = utf16Order(bytes);
    if (!order) {
        const auto* const text = reinterpret_cast<const char*>(bytes.data());
        return XmlRun(std::string_view(text, bytes.size()), nullptr).read();
    }
    // Converted here because Expat passes on surrogates without their partner.
    const std::string text = utf8FromUtf16(bytes, *order);
    return XmlRun(text, "UTF-8").read();
}

} // namespace orvane
