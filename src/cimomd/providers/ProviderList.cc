#include "providers/ProviderList.h"
#include "providers/MissingValueProvider.h"

#include "providers/computer/BiosElementProvider.h"
#include "providers/computer/BoardProvider.h"
#include "providers/computer/ChassisProvider.h"
#include "providers/computer/ComputerSystemProvider.h"
#include "providers/computer/MemoryProvider.h"
#include "providers/computer/PhysicalMemoryProvider.h"
#include "providers/computer/SlotProvider.h"
#include "providers/devices/BatteryProvider.h"
#include "providers/devices/DesktopMonitorProvider.h"
#include "providers/devices/FanProvider.h"
#include "providers/devices/NumericSensorProvider.h"
#include "providers/devices/PciDeviceProvider.h"
#include "providers/devices/UsbDeviceProvider.h"
#include "providers/devices/VideoControllerProvider.h"
#include "providers/network/DnsSettingDataProvider.h"
#include "providers/network/EthernetPortProvider.h"
#include "providers/network/IpProtocolEndpointProvider.h"
#include "providers/network/LanEndpointProvider.h"
#include "providers/network/NextHopIpRouteProvider.h"
#include "providers/network/WiFiPortProvider.h"
#include "providers/processor/CacheMemoryProvider.h"
#include "providers/processor/ProcessorProvider.h"
#include "providers/software/AccountProvider.h"
#include "providers/software/GroupProvider.h"
#include "providers/software/OperatingSystemProvider.h"
#include "providers/software/ServiceProvider.h"
#include "providers/software/SoftwareIdentityProvider.h"
#include "providers/software/TimeZoneProvider.h"
#include "providers/software/UnixProcessProvider.h"
#include "providers/storage/CDROMDriveProvider.h"
#include "providers/storage/DiskDriveProvider.h"
#include "providers/storage/DiskPackageProvider.h"
#include "providers/storage/DiskPartitionProvider.h"
#include "providers/storage/LocalFileSystemProvider.h"
#include "providers/storage/NFSProvider.h"
#include "providers/storage/RemoteFileSystemProvider.h"
#include "providers/storage/StorageVolumeProvider.h"

namespace cimomd {

ProviderList makeProviders(const SystemPaths& paths, const SystemCalls& calls) {
    ProviderList providers;
    providers.push_back(std::make_unique<ComputerSystemProvider>(paths));
    providers.push_back(std::make_unique<ChassisProvider>(paths));
    providers.push_back(std::make_unique<BoardProvider>(paths));
    providers.push_back(std::make_unique<BiosElementProvider>(paths));
    providers.push_back(std::make_unique<PhysicalMemoryProvider>(paths));
    providers.push_back(std::make_unique<MemoryProvider>(paths));
    providers.push_back(std::make_unique<SlotProvider>(paths));
    providers.push_back(std::make_unique<OperatingSystemProvider>(paths, calls));
    providers.push_back(std::make_unique<ProcessorProvider>(paths));
    providers.push_back(std::make_unique<CacheMemoryProvider>(paths));
    providers.push_back(std::make_unique<DiskDriveProvider>(paths));
    providers.push_back(std::make_unique<DiskPackageProvider>(paths));
    providers.push_back(std::make_unique<DiskPartitionProvider>(paths));
    providers.push_back(std::make_unique<StorageVolumeProvider>(paths));
    providers.push_back(std::make_unique<CDROMDriveProvider>(paths));
    providers.push_back(std::make_unique<LocalFileSystemProvider>(paths, calls));
    providers.push_back(std::make_unique<NFSProvider>(paths, calls));
    providers.push_back(std::make_unique<RemoteFileSystemProvider>(paths, calls));
    providers.push_back(std::make_unique<PciDeviceProvider>(paths));
    providers.push_back(std::make_unique<UsbDeviceProvider>(paths));
    providers.push_back(std::make_unique<VideoControllerProvider>(paths));
    providers.push_back(std::make_unique<DesktopMonitorProvider>(paths));
    providers.push_back(std::make_unique<BatteryProvider>(paths, calls));
    providers.push_back(std::make_unique<NumericSensorProvider>(paths, calls));
    providers.push_back(std::make_unique<FanProvider>(paths, calls));
    providers.push_back(std::make_unique<EthernetPortProvider>(paths, calls));
    providers.push_back(std::make_unique<WiFiPortProvider>(paths, calls));
    providers.push_back(std::make_unique<LanEndpointProvider>(paths, calls));
    providers.push_back(std::make_unique<IpProtocolEndpointProvider>(paths, calls));
    providers.push_back(std::make_unique<NextHopIpRouteProvider>(paths));
    providers.push_back(std::make_unique<DnsSettingDataProvider>(paths));
    providers.push_back(std::make_unique<SoftwareIdentityProvider>(paths, calls));
    providers.push_back(std::make_unique<UnixProcessProvider>(paths, calls));
    providers.push_back(std::make_unique<ServiceProvider>(paths));
    providers.push_back(std::make_unique<AccountProvider>(paths, calls));
    providers.push_back(std::make_unique<GroupProvider>(paths));
    providers.push_back(std::make_unique<TimeZoneProvider>(paths, calls));
    providers.push_back(std::make_unique<MissingValueProvider>(providers));
    return providers;
}

}  // namespace cimomd
