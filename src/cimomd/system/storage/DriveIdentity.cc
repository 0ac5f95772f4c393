#include "system/storage/DriveIdentity.h"

#include <initializer_list>

#include "files/TextFile.h"
#include "system/computer/FirmwareText.h"
#include "text/Utf8.h"

namespace cimomd {
namespace {

// What the SCSI layer puts in the maker's place for drives that speak ATA.
constexpr std::string_view kAta = "ATA";

Fact<std::string> firstOf(const std::filesystem::path& directory,
                          std::initializer_list<const char*> files) {
    Fact<std::string> found;
    for (const char* file : files)
        found = found.orElse(withoutPlaceholder(readFact(directory / file)));
    return found;
}

/// Virtual devices give the number of their bus's registry.
std::optional<std::string> makerIn(const std::string& text) {
    if (text == kAta || text.substr(0, 2) == "0x")
        return std::nullopt;
    return text;
}

Fact<std::string> vendorOf(const std::filesystem::path& directory, const UdevRecord& udev) {
    return firstOf(directory, {"device/vendor"})
        .then(makerIn)
        .orElse(withoutPlaceholder(udev.text("ID_VENDOR")).then(makerIn));
}

/// The SCSI layer cuts the model of an ATA drive after 16 characters; udev has it whole.
Fact<std::string> modelOf(const std::filesystem::path& directory, const UdevRecord& udev) {
    const auto own = firstOf(directory, {"device/model", "device/name"});
    const auto asked = withoutPlaceholder(udev.text("ID_MODEL"));
    const bool isCut = readFact(directory / "device/vendor") == std::string(kAta);
    return isCut ? asked.orElse(own) : own.orElse(asked);
}

Fact<std::string> serialOf(const std::filesystem::path& directory, const UdevRecord& udev) {
    const auto page = readText(directory / "device/vpd_pg80");
    return firstOf(directory, {"device/serial", "serial"})
        .orElse(withoutPlaceholder(page.then(parseSerialPage, Absence::Unreadable)))
        .orElse(withoutPlaceholder(udev.property("ID_SERIAL_SHORT")));
}

}  // namespace

DriveIdentity readDriveIdentity(const std::filesystem::path& directory, const UdevRecord& udev) {
    DriveIdentity out;
    out.vendor = vendorOf(directory, udev);
    out.model = modelOf(directory, udev);
    out.serial = serialOf(directory, udev);
    out.firmware = firstOf(directory, {"device/firmware_rev", "device/rev", "device/fwrev"})
                       .orElse(withoutPlaceholder(udev.property("ID_REVISION")));
    out.worldWideId = firstOf(directory, {"wwid", "device/wwid"})
                          .orElse(withoutPlaceholder(udev.property("ID_WWN")));
    return out;
}

std::optional<std::string> parseSerialPage(std::string_view bytes) {
    constexpr std::size_t kHeadLength = 4;
    constexpr unsigned char kSerialPage = 0x80;
    if (bytes.size() < kHeadLength || static_cast<unsigned char>(bytes[1]) != kSerialPage)
        return std::nullopt;
    const std::size_t length = static_cast<unsigned char>(bytes[2]) * std::size_t{256} +
                               static_cast<unsigned char>(bytes[3]);
    const std::string_view serial = trimmed(bytes.substr(kHeadLength, length));
    return serial.empty() ? std::nullopt : std::optional<std::string>(serial);
}

}  // namespace cimomd
