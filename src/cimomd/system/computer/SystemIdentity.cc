#include "system/computer/SystemIdentity.h"

#include <fmt/format.h>

#include "files/TextFile.h"
#include "system/computer/FirmwareText.h"
#include "system/computer/SmbiosTable.h"

namespace cimomd {
namespace {

constexpr std::size_t kUuidBytes = 16;

/// Up to version 2.5 makers wrote all numbers of a UUID with the highest byte first, from then on
/// the standard demands the lowest first for those of the first three groups.
std::string uuidText(std::string bytes, const SmbiosVersion& version) {
    if (version.atLeast(2, 6)) {
        std::swap(bytes[0], bytes[3]);
        std::swap(bytes[1], bytes[2]);
        std::swap(bytes[4], bytes[5]);
        std::swap(bytes[6], bytes[7]);
    }
    std::string text;
    for (std::size_t i = 0; i < kUuidBytes; ++i) {
        if (i == 4 || i == 6 || i == 8 || i == 10)
            text += '-';
        text += fmt::format("{:02x}", static_cast<std::uint8_t>(bytes[i]));
    }
    return text;
}

SystemIdentity identityOf(const SmbiosTable& table) {
    SystemIdentity out;
    for (const SmbiosStructure* system : table.ofType(smbios::kSystem)) {
        out.manufacturer = system->text(0x04);
        out.model = system->text(0x05);
        out.version = system->text(0x06);
        out.serialNumber = system->text(0x07);
        out.uuid = withoutPlaceholder(
            system->bytes(0x08, kUuidBytes).then([&table](const std::string& bytes) {
                return uuidText(bytes, table.version);
            }));
        out.wakeUpType = system->byte(0x18);
        out.sku = system->text(0x19);
        out.family = system->text(0x1A);
        break;
    }
    for (const SmbiosStructure* security : table.ofType(smbios::kHardwareSecurity)) {
        constexpr unsigned kResetButtonBits = 3;
        out.resetButton = security->byte(0x04).then([](std::uint8_t settings) {
            return static_cast<std::uint8_t>(settings & kResetButtonBits);
        });
        break;
    }
    return out;
}

/// `missing`: why the tables cannot be read.
SystemIdentity identityFromKernel(const std::filesystem::path& directory, Absence missing) {
    const auto fact = [&directory, missing](const char* name) {
        return readFirmwareText(directory / name).orElse(missing);
    };
    SystemIdentity out;
    out.manufacturer = fact("sys_vendor");
    out.model = fact("product_name");
    out.version = fact("product_version");
    out.serialNumber = fact("product_serial");
    out.uuid = fact("product_uuid");
    out.sku = fact("product_sku");
    out.family = fact("product_family");
    out.wakeUpType = missing;
    out.resetButton = missing;
    return out;
}

}  // namespace

SystemIdentity readSystemIdentity(const SystemPaths& paths) {
    const Fact<SmbiosTable> table = readSmbiosTable(paths);
    SystemIdentity out =
        table ? identityOf(*table) : identityFromKernel(paths.firmwareIdentity(), table.reason());
    out.model = out.model.orElse(readFirmwareText(paths.deviceTree() / "model"));
    out.serialNumber =
        out.serialNumber.orElse(readFirmwareText(paths.deviceTree() / "serial-number"));
    out.machineId = readFirmwareText(paths.machineId());
    return out;
}

std::string readHostName(const SystemPaths& paths) {
    const auto name = readFact(paths.hostName());
    return name && *name != "(none)" ? *name : "localhost";
}

}  // namespace cimomd
