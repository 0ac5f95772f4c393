#include "system/computer/SystemIdentity.h"

#include "files/TextFile.h"
#include "system/computer/FirmwareText.h"

namespace cimomd {

SystemIdentity readSystemIdentity(const SystemPaths& paths) {
    const std::filesystem::path firmware = paths.firmwareIdentity();
    const auto fact = [](const std::filesystem::path& path) {
        return withoutPlaceholder(readFact(path));
    };
    SystemIdentity out;
    out.manufacturer = fact(firmware / "sys_vendor");
    out.model = fact(firmware / "product_name");
    out.version = fact(firmware / "product_version");
    out.serialNumber = fact(firmware / "product_serial");
    out.uuid = fact(firmware / "product_uuid");
    out.machineId = fact(paths.machineId());
    if (!out.model)
        out.model = fact(paths.deviceTree() / "model");
    if (!out.serialNumber)
        out.serialNumber = fact(paths.deviceTree() / "serial-number");
    return out;
}

std::string readHostName(const SystemPaths& paths) {
    const auto name = readFact(paths.hostName());
    return name && *name != "(none)" ? *name : "localhost";
}

}  // namespace cimomd
