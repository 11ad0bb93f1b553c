#include "LogGenerator/GSM/Sections.h"

#include "platform/base/LogMessage.h"
#include "platform/base/PropertyValue.h"
#include "platform/plist/PropertyList.h"

namespace orvane
{

namespace
{

constexpr PacketLayout kPackets[] = {ownPacket(kPdpContextsCode, 0)};

constexpr SectionLayout kLayout = {"PDP Context Info", "PDPContextList", UnknownCode::Report,
                                   kPackets};

} // namespace

PDPContextList::PDPContextList() : ListSection(kLayout) {}

void PDPContextList::decode(PacketView packet, const PacketLayout&)
{
    const PropertyValue contexts = readPropertyList(packet.from(kLogHeaderBytes).bytes()).value;
    if (const PropertyArray* array = contexts.asArray())
        replaceArray(list().get(), array->elements());
}

} // namespace orvane
