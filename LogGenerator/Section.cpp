#include "LogGenerator/Section.h"

#include "platform/base/Bytes.h"
#include "platform/base/PropertyValue.h"

namespace orvane
{

void Section::updateWithData(ByteView data, std::uint32_t logCode)
{
    logLine(_layout->callPriority, "%s", _layout->callText);
    for (const PacketLayout& layout : _layout->packets) {
        if (layout.logCode != logCode)
            continue;
        if (data.size() >= layout.minimumBytes)
            decode(PacketView(data), layout);
        return;
    }
    if (_layout->unknownCode == UnknownCode::Report)
        reportUnknownCode(logCode);
}

std::vector<std::uint32_t> Section::getLogCodeArray() const
{
    std::vector<std::uint32_t> codes;
    for (const PacketLayout& layout : _layout->packets)
        codes.push_back(layout.logCode);
    return codes;
}

void Section::decode(PacketView packet, const PacketLayout& layout)
{
    if (layout.cells)
        writeFirstCell(rows().get(), packet, *layout.cells);
    else
        writeRows(rows().get(), packet, layout.fields);
}

void Section::reportUnknownCode(std::uint32_t logCode)
{
    logError("Received an unknown log message: %d", static_cast<int>(logCode));
}

void ListSection::decode(PacketView packet, const PacketLayout& layout)
{
    const std::shared_ptr<PropertyArray> shown = list();
    _elements.begin(takeElements(shown.get()));
    fill(_elements, packet, layout);
    replaceArray(shown.get(), _elements.take());
}

void ListSection::fill(ListElements& elements, PacketView packet, const PacketLayout& layout)
{
    if (layout.cells)
        addCells(elements, packet, *layout.cells);
    else if (layout.records)
        layout.records->addTo(elements, packet);
}

} // namespace orvane
