#include "providers/computer/SlotProvider.h"

#include <fmt/format.h>

#include "providers/PhysicalElement.h"
#include "providers/RecordStream.h"
#include "providers/computer/SlotKind.h"

namespace cimomd {

using Pegasus::Uint16;

std::unique_ptr<InstanceStream> SlotProvider::enumerate() const {
    const Fact<SmbiosTable> table = readSmbiosTable(paths);
    if (!table)
        return std::make_unique<EmptyStream>(table.reason());
    return std::make_unique<RecordStream<Slot>>(slotsOf(*table), publish);
}

ProvidedInstance SlotProvider::publish(const Slot& slot) {
    constexpr std::size_t kAddressLength = 16;
    PhysicalElement element;
    element.tag = fmt::format("Slot {}", slot.index);
    element.title = slot.designation.value_or(element.tag);
    element.name = slot.designation;
    InstanceBuilder builder(kClassName);
    addPhysicalElement(builder, element);
    builder.value<Uint16>("ConnectorLayout", slot.type.then(connectorLayoutOf))
        .value<Pegasus::Boolean>("SupportsHotPlug", slot.supportsHotPlug)
        .value<Uint16>("MaxDataWidth", slot.dataBusWidth.then(dataBitsOf, Absence::Absent))
        .value<Uint16>("Number", slot.number)
        .value<Uint16>("MaxLinkWidth", slot.dataBusWidth.then(lanesOf, Absence::Absent))
        .text("SlotType", slot.type.then(slotTypeName, Absence::Absent))
        .value<Pegasus::Boolean>("InUse", slot.inUse)
        .text("PCIAddress", slot.pciAddress, kAddressLength);
    return builder.take();
}

}  // namespace cimomd
