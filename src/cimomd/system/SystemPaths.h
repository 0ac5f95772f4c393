#pragma once

// Where the machine's facts are read. Every path lies below one root, so that tests read a recorded
// tree; an object whose root nobody set refuses to name any path.

#include <filesystem>
#include <string_view>

namespace cimomd {

class SystemPaths {
  public:
    SystemPaths() = default;
    explicit SystemPaths(std::filesystem::path rootDirectory) : root(std::move(rootDirectory)) {}

    // Each raises std::logic_error when no root was set.
    std::filesystem::path hostName() const { return below("proc/sys/kernel/hostname"); }
    std::filesystem::path kernelRelease() const { return below("proc/sys/kernel/osrelease"); }
    std::filesystem::path architecture() const { return below("proc/sys/kernel/arch"); }
    std::filesystem::path processes() const { return below("proc"); }
    std::filesystem::path kernelStatistics() const { return below("proc/stat"); }
    std::filesystem::path memory() const { return below("proc/meminfo"); }
    std::filesystem::path processors() const { return below("proc/cpuinfo"); }
    std::filesystem::path mounts() const { return below("proc/self/mountinfo"); }
    std::filesystem::path deviceTree() const { return below("proc/device-tree"); }
    std::filesystem::path logicalProcessors() const { return below("sys/devices/system/cpu"); }
    std::filesystem::path networkInterfaces() const { return below("sys/class/net"); }
    std::filesystem::path pciDevices() const { return below("sys/bus/pci/devices"); }
    std::filesystem::path usbDevices() const { return below("sys/bus/usb/devices"); }
    std::filesystem::path graphics() const { return below("sys/class/drm"); }
    std::filesystem::path powerSupplies() const { return below("sys/class/power_supply"); }
    std::filesystem::path hardwareMonitors() const { return below("sys/class/hwmon"); }
    /// pci.ids and usb.ids, on Debian.
    std::filesystem::path miscellaneousLists() const { return below("usr/share/misc"); }
    /// The same on other distributions.
    std::filesystem::path hardwareLists() const { return below("usr/share/hwdata"); }
    std::filesystem::path firmwareIdentity() const { return below("sys/class/dmi/id"); }
    std::filesystem::path firmwareTables() const { return below("sys/firmware/dmi/tables"); }
    std::filesystem::path uefi() const { return below("sys/firmware/efi"); }
    std::filesystem::path ipv4Routes() const { return below("proc/net/route"); }
    std::filesystem::path ipv6Routes() const { return below("proc/net/ipv6_route"); }
    std::filesystem::path resolver() const { return below("etc/resolv.conf"); }
    /// The servers that the local stub of systemd-resolved asks.
    std::filesystem::path resolverBehindStub() const {
        return below("run/systemd/resolve/resolv.conf");
    }
    std::filesystem::path blockDevices() const { return below("sys/block"); }
    std::filesystem::path blockDevicesAndPartitions() const { return below("sys/class/block"); }
    std::filesystem::path udevRecords() const { return below("run/udev/data"); }
    std::filesystem::path opticalDrives() const { return below("proc/sys/dev/cdrom/info"); }
    std::filesystem::path osRelease() const { return below("etc/os-release"); }
    std::filesystem::path vendorOsRelease() const { return below("usr/lib/os-release"); }
    std::filesystem::path machineId() const { return below("etc/machine-id"); }
    std::filesystem::path sessions() const { return below("run/utmp"); }
    std::filesystem::path systemBus() const { return below("run/dbus/system_bus_socket"); }
    std::filesystem::path accounts() const { return below("etc/passwd"); }
    std::filesystem::path groups() const { return below("etc/group"); }
    std::filesystem::path lastLogins() const { return below("var/log/lastlog"); }
    std::filesystem::path localTime() const { return below("etc/localtime"); }
    std::filesystem::path timeZoneName() const { return below("etc/timezone"); }
    std::filesystem::path debianPackages() const { return below("var/lib/dpkg"); }
    std::filesystem::path rpmPackages() const { return below("var/lib/rpm"); }
    std::filesystem::path vendorRpmPackages() const { return below("usr/lib/sysimage/rpm"); }
    /// Only in recorded trees: what statvfs said when the tree was recorded.
    std::filesystem::path recordedFileSystemSizes() const { return below("statvfs"); }
    /// Only in recorded trees: the addresses of the interfaces, as netlink told them.
    std::filesystem::path recordedAddresses() const { return below("netlink-addresses"); }
    /// Only in recorded trees: what the drivers of the network ports told.
    std::filesystem::path recordedLinks() const { return below("ethtool"); }

    /// `path`, relative to the root.
    std::filesystem::path below(std::string_view path) const;

  private:
    std::filesystem::path root;
};

}  // namespace cimomd
