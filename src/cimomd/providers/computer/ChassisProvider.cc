#include "providers/computer/ChassisProvider.h"

#include <fmt/format.h>

#include <array>

#include "providers/PhysicalElement.h"
#include "providers/RecordStream.h"

namespace cimomd {
namespace {

using Pegasus::Uint16;

constexpr std::uint8_t kOther = 1;
constexpr std::uint8_t kUnknown = 2;

// The last kinds that the CIM lists have.
constexpr std::uint8_t kLastPackageType = 32;
constexpr std::uint8_t kLastChassisType = 25;

/// The names of DSP0134, by their number.
constexpr std::array<const char*, 37> kTypeNames{nullptr,
                                                 "Other",
                                                 nullptr,
                                                 "Desktop",
                                                 "Low Profile Desktop",
                                                 "Pizza Box",
                                                 "Mini Tower",
                                                 "Tower",
                                                 "Portable",
                                                 "Laptop",
                                                 "Notebook",
                                                 "Hand Held",
                                                 "Docking Station",
                                                 "All in One",
                                                 "Sub Notebook",
                                                 "Space-saving",
                                                 "Lunch Box",
                                                 "Main Server Chassis",
                                                 "Expansion Chassis",
                                                 "SubChassis",
                                                 "Bus Expansion Chassis",
                                                 "Peripheral Chassis",
                                                 "RAID Chassis",
                                                 "Rack Mount Chassis",
                                                 "Sealed-case PC",
                                                 "Multi-system Chassis",
                                                 "Compact PCI",
                                                 "Advanced TCA",
                                                 "Blade",
                                                 "Blade Enclosure",
                                                 "Tablet",
                                                 "Convertible",
                                                 "Detachable",
                                                 "IoT Gateway",
                                                 "Embedded PC",
                                                 "Mini PC",
                                                 "Stick PC"};

std::optional<std::string> typeName(std::uint8_t type) {
    if (type >= kTypeNames.size() || kTypeNames[type] == nullptr)
        return std::nullopt;
    return kTypeNames[type];
}

std::optional<Uint16> packageType(std::uint8_t type) {
    if (type == 0)
        return std::nullopt;
    if (type == kUnknown)
        return Uint16{0};
    return type > kLastPackageType ? kOther : type;
}

std::optional<std::vector<Uint16>> chassisTypes(std::uint8_t type) {
    if (type == 0)
        return std::nullopt;
    return std::vector<Uint16>{type > kLastChassisType ? kOther : type};
}

Fact<Uint16> widened(const Fact<std::uint8_t>& number) {
    return number.then([](std::uint8_t value) { return Uint16{value}; });
}

Fact<std::vector<std::string>> oneText(const Fact<std::string>& text) {
    return text.then([](const std::string& only) { return std::vector<std::string>{only}; });
}

}  // namespace

std::unique_ptr<InstanceStream> ChassisProvider::enumerate() const {
    const Fact<std::vector<Chassis>> found = readChassis(paths);
    if (!found)
        return std::make_unique<EmptyStream>(found.reason());
    return std::make_unique<RecordStream<Chassis>>(*found, publish);
}

ProvidedInstance ChassisProvider::publish(const Chassis& chassis) {
    const Fact<std::string> kind = chassis.type.then(typeName);
    PhysicalElement element;
    element.tag = fmt::format("Chassis {}", chassis.index);
    element.title = kind.value_or(element.tag);
    element.manufacturer = chassis.manufacturer;
    element.sku = chassis.sku;
    element.serialNumber = chassis.serialNumber;
    element.version = chassis.version;
    element.assetTag = chassis.assetTag;
    InstanceBuilder builder(kClassName);
    addPhysicalElement(builder, element);
    addRemovability(builder, {});
    builder.value<Pegasus::Boolean>("LockPresent", chassis.lockPresent)
        .value<Uint16>("NumberOfPowerCords", widened(chassis.powerCords))
        .value<Uint16>("ChassisPackageType", chassis.type.then(packageType))
        .text("ChassisTypeDescription", kind)
        .values<Uint16>("ChassisTypes", chassis.type.then(chassisTypes))
        .texts("TypeDescriptions", oneText(kind))
        .value<Uint16>("HeightUnits", widened(chassis.heightUnits));
    return builder.take();
}

}  // namespace cimomd
