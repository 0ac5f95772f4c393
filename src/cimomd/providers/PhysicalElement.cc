#include "providers/PhysicalElement.h"

namespace cimomd {
namespace {

// MaxLen of the properties of CIM_PhysicalElement.
constexpr std::size_t kNameLength = 1024;
constexpr std::size_t kTextLength = 256;
constexpr std::size_t kShortTextLength = 64;

}  // namespace

void addPhysicalElement(InstanceBuilder& builder, const PhysicalElement& element) {
    builder.label(element.title)
        .physicalKeys(element.tag)
        .text("Name", element.name, kNameLength)
        .values<Pegasus::Uint16>("OperationalStatus", Absence::Absent)
        .text("Manufacturer", element.manufacturer, kTextLength)
        .text("Model", element.model, kTextLength)
        .text("SKU", element.sku, kShortTextLength)
        .text("SerialNumber", element.serialNumber, kTextLength)
        .text("Version", element.version, kShortTextLength)
        .text("PartNumber", element.partNumber, kTextLength)
        .text("OtherIdentifyingInfo", element.assetTag, kTextLength);
}

void addRemovability(InstanceBuilder& builder, const Removability& removability) {
    builder.value<Pegasus::Boolean>("Removable", removability.removable)
        .value<Pegasus::Boolean>("Replaceable", removability.replaceable)
        .value<Pegasus::Boolean>("HotSwappable", removability.hotSwappable);
}

}  // namespace cimomd
