#include "providers/computer/ComputerSystemProvider.h"

#include <array>

#include "providers/EnumeratedValues.h"
#include "providers/InstanceBuilder.h"
#include "providers/RecordStream.h"

namespace cimomd {
namespace {

constexpr std::size_t kTextLength = 256;
constexpr std::size_t kIdentifierLength = 64;

/// Two parallel lists: what identifies the machine elsewhere, and what kind of text each is.
struct OtherIdentification {
    std::vector<std::string> values;
    std::vector<std::string> descriptions;

    void add(const Fact<std::string>& value, const char* description) {
        if (!value)
            return;
        values.push_back(*value);
        descriptions.emplace_back(description);
    }
};

/// CIM_ComputerSystem.ResetCapability.
std::optional<Pegasus::Uint16> resetCapability(std::uint8_t resetButton) {
    constexpr std::array<Pegasus::Uint16, 4> kCapabilities{3, 4, 5, 2};
    if (resetButton >= kCapabilities.size())
        return std::nullopt;
    return kCapabilities[resetButton];
}

/// CIM_UnitaryComputerSystem.WakeUpType has the numbers of DSP0134.
std::optional<Pegasus::Uint16> wakeUpType(std::uint8_t number) {
    constexpr std::uint8_t kLast = 8;
    return number > kLast ? std::nullopt : std::optional<Pegasus::Uint16>(number);
}

OtherIdentification otherIdentification(const SystemIdentity& identity) {
    OtherIdentification out;
    out.add(identity.serialNumber, "Serial number");
    out.add(identity.uuid, "UUID");
    out.add(identity.machineId, "Machine id");
    return out;
}

}  // namespace

std::unique_ptr<InstanceStream> ComputerSystemProvider::enumerate() const {
    const std::string hostName = readHostName(paths);
    return std::make_unique<RecordStream<SystemIdentity>>(
        std::vector<SystemIdentity>{readSystemIdentity(paths)},
        [hostName](const SystemIdentity& identity) { return publish(hostName, identity); });
}

ProvidedInstance ComputerSystemProvider::publish(const std::string& hostName,
                                                 const SystemIdentity& identity) {
    const OtherIdentification other = otherIdentification(identity);
    const Fact<std::string> anyOther =
        identity.serialNumber.orElse(identity.uuid).orElse(identity.machineId);
    InstanceBuilder builder(kClassName);
    builder.label(hostName)
        .key("Name", hostName, kSystemNameLength)
        .values<Pegasus::Uint16>("OperationalStatus", {kOperationalOk})
        .value<Pegasus::Uint16>("EnabledState", kEnabled)
        .text("CreationClassName", kClassName)
        .text("NameFormat", "Other")
        .texts("OtherIdentifyingInfo",
               anyOther.then([&other](const std::string&) { return other.values; }))
        .texts("IdentifyingDescriptions",
               anyOther.then([&other](const std::string&) { return other.descriptions; }))
        .values<Pegasus::Uint16>("Dedicated", {kNotDedicated})
        .value<Pegasus::Uint16>("ResetCapability", identity.resetButton.then(resetCapability))
        .value<Pegasus::Uint16>("WakeUpType", identity.wakeUpType.then(wakeUpType))
        .text("Manufacturer", identity.manufacturer, kTextLength)
        .text("Model", identity.model, kTextLength)
        .text("ModelVersion", identity.version, kTextLength)
        .text("SerialNumber", identity.serialNumber, kTextLength)
        .text("UUID", identity.uuid, kIdentifierLength)
        .text("SKU", identity.sku, kTextLength)
        .text("Family", identity.family, kTextLength)
        .text("MachineId", identity.machineId, kIdentifierLength);
    return builder.take();
}

}  // namespace cimomd
