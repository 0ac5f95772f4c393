#include "providers/computer/ComputerSystemProvider.h"

#include "providers/EnumeratedValues.h"
#include "providers/InstanceBuilder.h"
#include "providers/RecordStream.h"

namespace cimomd {
namespace {

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
    InstanceBuilder builder(kClassName);
    builder.label(hostName)
        .key("Name", hostName, kSystemNameLength)
        .values<Pegasus::Uint16>("OperationalStatus", {kOperationalOk})
        .value<Pegasus::Uint16>("EnabledState", kEnabled)
        .text("CreationClassName", kClassName)
        .text("NameFormat", "Other")
        .texts("OtherIdentifyingInfo", other.values)
        .texts("IdentifyingDescriptions", other.descriptions)
        .values<Pegasus::Uint16>("Dedicated", {kNotDedicated})
        .text("Manufacturer", identity.manufacturer)
        .text("Model", identity.model)
        .text("ModelVersion", identity.version)
        .text("SerialNumber", identity.serialNumber)
        .text("UUID", identity.uuid)
        .text("MachineId", identity.machineId);
    return builder.take();
}

}  // namespace cimomd
