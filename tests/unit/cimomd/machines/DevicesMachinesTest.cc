// What the recorded machines show on their buses, screens, batteries and sensors.

#include <gtest/gtest.h>

#include "machines/MachineInstances.h"
#include "providers/devices/BatteryProvider.h"
#include "providers/devices/DesktopMonitorProvider.h"
#include "providers/devices/FanProvider.h"
#include "providers/devices/NumericSensorProvider.h"
#include "providers/devices/PciDeviceProvider.h"
#include "providers/devices/UsbDeviceProvider.h"
#include "providers/devices/VideoControllerProvider.h"

namespace cimomd {
namespace {

using Pegasus::CIMInstance;
template <typename Provider>
std::vector<CIMInstance> instancesOf(const char* machineName) {
    return all(providerOf<Provider>(machineName).enumerate());
}

template <typename Provider>
std::vector<std::string> valuesOn(const char* machineName, const char* property) {
    std::vector<std::string> values;
    for (const CIMInstance& instance : instancesOf<Provider>(machineName))
        values.push_back(textOf(instance, property));
    return values;
}

template <typename Provider>
std::optional<Absence> absenceOn(const char* machineName) {
    const auto stream = providerOf<Provider>(machineName).enumerate();
    ProvidedInstance provided;
    EXPECT_FALSE(stream->next(provided));
    return stream->absence();
}

using Texts = std::vector<std::string>;

TEST(DevicesMachines, pciDevicesOfTheLaptop) {
    EXPECT_EQ(valuesOn<PciDeviceProvider>("laptop", "DeviceID"),
              (Texts{"0000:00:00.0", "0000:00:02.0", "0000:00:14.0", "0000:00:14.3", "0000:09:00.0",
                     "10000:e0:06.0"}));
    const auto devices = instancesOf<PciDeviceProvider>("laptop");
    expectProperties(devices[3], {{"CreationClassName", "Velmira_PCIDevice"},
                                  {"SystemCreationClassName", "Velmira_ComputerSystem"},
                                  {"Caption", "Intel Corporation Wi-Fi 6 AX201"},
                                  {"ElementName", "Intel Corporation Wi-Fi 6 AX201"},
                                  {"Name", "Intel Corporation Wi-Fi 6 AX201"},
                                  {"OperationalStatus", "null"},
                                  {"EnabledState", "5"},
                                  {"VendorID", "32902"},
                                  {"PCIDeviceID", "41200"},
                                  {"SubsystemVendorID", "32902"},
                                  {"SubsystemID", "116"},
                                  {"ClassCode", "2"},
                                  {"BusNumber", "0"},
                                  {"DeviceNumber", "20"},
                                  {"FunctionNumber", "3"},
                                  {"RevisionNumber", "32"},
                                  {"HardwareId", "8086:a0f0"},
                                  {"VendorName", "Intel Corporation"},
                                  {"ProductName", "Wi-Fi 6 AX201"},
                                  {"SubsystemName", "Wi-Fi 6 AX201 160MHz"},
                                  {"ClassName", "Network controller"},
                                  {"Driver", "iwlwifi"}});
    // The list has a subsystem of another maker only.
    expectProperties(devices[1], {{"SubsystemVendorID", "6058"},
                                  {"SubsystemName", "null"},
                                  {"ClassName", "VGA compatible controller"}});
    expectProperties(devices[0], {{"Driver", "null"}, {"ClassName", "Host bridge"}});
    expectProperties(devices[4], {{"ClassName", "Non-Volatile memory controller"},
                                  {"ProductName", "NVMe SSD Controller PM9A1/PM9A3/980PRO"},
                                  {"BusNumber", "9"}});
    expectProperties(devices[5], {{"BusNumber", "224"},
                                  {"DeviceNumber", "6"},
                                  {"SubsystemVendorID", "null"},
                                  {"SubsystemID", "null"},
                                  {"ClassName", "PCI bridge"}});
}

TEST(DevicesMachines, pciDevicesOfTheServer) {
    EXPECT_EQ(valuesOn<PciDeviceProvider>("server", "DeviceID"),
              (Texts{"0000:00:00.0", "0000:02:00.0", "0000:18:00.0", "0000:3b:00.0", "0000:3b:00.1",
                     "0000:af:00.0"}));
    EXPECT_EQ(valuesOn<PciDeviceProvider>("server", "SubsystemName"),
              (Texts{"null", "null", "AOC-S3008L-L8e", "Ethernet Converged Network Adapter X710-2",
                     "Ethernet Converged Network Adapter X710", "null"}));
    EXPECT_EQ(valuesOn<PciDeviceProvider>("server", "ClassCode"),
              (Texts{"6", "3", "1", "2", "2", "2"}));
    expectProperties(instancesOf<PciDeviceProvider>("server")[5],
                     {{"Name", "Mellanox Technologies MT27710 Family [ConnectX-4 Lx]"},
                      {"HardwareId", "15b3:1015"},
                      {"BusNumber", "175"},
                      {"Driver", "mlx5_core"}});
}

TEST(DevicesMachines, pciDevicesWithoutAListOfNames) {
    const auto devices = instancesOf<PciDeviceProvider>("virtual");
    ASSERT_EQ(devices.size(), 4U);
    expectProperties(devices[3], {{"DeviceID", "0000:00:03.0"},
                                  {"Name", "1af4:1042"},
                                  {"HardwareId", "1af4:1042"},
                                  {"ClassCode", "1"},
                                  {"VendorName", "null"},
                                  {"ProductName", "null"},
                                  {"SubsystemName", "null"},
                                  {"ClassName", "null"},
                                  {"Driver", "virtio-pci"}});
    EXPECT_EQ(absenceOn<PciDeviceProvider>("arm"), Absence::Absent);
}

TEST(DevicesMachines, usbDevicesOfTheLaptop) {
    EXPECT_EQ(valuesOn<UsbDeviceProvider>("laptop", "DeviceID"),
              (Texts{"3-3", "3-6", "3-10", "4-1"}));
    const auto devices = instancesOf<UsbDeviceProvider>("laptop");
    expectProperties(devices[0], {{"CreationClassName", "Velmira_USBDevice"},
                                  {"Name", "Chicony Electronics Co.,Ltd. Integrated Camera"},
                                  {"EnabledState", "2"},
                                  {"OperationalStatus", "null"},
                                  {"VendorID", "1266"},
                                  {"ProductID", "46826"},
                                  {"DeviceReleaseNumber", "33542"},
                                  {"DeviceRelease", "83.06"},
                                  {"USBVersionInBCD", "513"},
                                  {"USBVersion", "2.01"},
                                  {"ClassCode", "239"},
                                  {"Manufacturer", "Chicony Electronics Co.,Ltd."},
                                  {"Product", "Integrated Camera"},
                                  {"SerialNumber", "0001"},
                                  {"VendorName", "null"},
                                  {"ProductName", "null"},
                                  {"SpeedMbps", "480"},
                                  {"InterfaceClasses", "14 254 "}});
    // It says no name of its own, and may not be used.
    expectProperties(devices[1],
                     {{"Name", "Synaptics, Inc. Prometheus MIS Touch Fingerprint Reader"},
                      {"EnabledState", "3"},
                      {"Manufacturer", "null"},
                      {"Product", "null"},
                      {"VendorName", "Synaptics, Inc."},
                      {"ProductName", "Prometheus MIS Touch Fingerprint Reader"},
                      {"SerialNumber", "5d8b2f4f1a3c"},
                      {"InterfaceClasses", "255 "}});
    expectProperties(devices[2], {{"Name", "Intel Corp. AX201 Bluetooth"},
                                  {"HardwareId", "8087:0026"},
                                  {"SerialNumber", "null"},
                                  {"SpeedMbps", "12"}});
    expectProperties(devices[3], {{"Name", "SanDisk Ultra USB 3.0"},
                                  {"VendorName", "SanDisk Corp."},
                                  {"ProductName", "Ultra Flair"},
                                  {"USBVersion", "3.20"},
                                  {"SpeedMbps", "5000"},
                                  {"InterfaceClasses", "8 "}});
}

TEST(DevicesMachines, usbDevicesOfTheOthers) {
    EXPECT_EQ(valuesOn<UsbDeviceProvider>("server", "DeviceID"), (Texts{"1-11", "1-11.1"}));
    EXPECT_EQ(valuesOn<UsbDeviceProvider>("server", "Name"), (Texts{"0557:7000", "0557:2419"}));
    EXPECT_EQ(valuesOn<UsbDeviceProvider>("server", "SpeedMbps"), (Texts{"480", "1.5"}));
    EXPECT_EQ(valuesOn<UsbDeviceProvider>("virtual", "Name"), Texts{"QEMU USB Tablet"});
    EXPECT_EQ(valuesOn<UsbDeviceProvider>("virtual", "SerialNumber"), Texts{"42"});
    EXPECT_EQ(valuesOn<UsbDeviceProvider>("arm", "DeviceID"), (Texts{"1-1", "1-1.2", "1-1.10"}));
    EXPECT_EQ(valuesOn<UsbDeviceProvider>("arm", "Name"),
              (Texts{"USB2.0 Hub", "Logitech USB Keyboard", "Realtek USB 10/100/1000 LAN"}));
    EXPECT_EQ(valuesOn<UsbDeviceProvider>("arm", "USBVersion"), (Texts{"2.10", "1.10", "2.10"}));
}

TEST(DevicesMachines, videoControllers) {
    const auto laptop = instancesOf<VideoControllerProvider>("laptop");
    ASSERT_EQ(laptop.size(), 1U);
    expectProperties(laptop[0], {{"DeviceID", "0000:00:02.0"},
                                 {"CreationClassName", "Velmira_VideoController"},
                                 {"Name", "Intel Corporation TigerLake-LP GT2 [Iris Xe Graphics]"},
                                 {"VideoProcessor", "TigerLake-LP GT2 [Iris Xe Graphics]"},
                                 {"VendorName", "Intel Corporation"},
                                 {"HardwareId", "8086:9a49"},
                                 {"Driver", "i915"},
                                 {"EnabledState", "5"},
                                 {"VideoMemoryMB", "null"}});
    EXPECT_EQ(valuesOn<VideoControllerProvider>("server", "Name"),
              Texts{"ASPEED Technology, Inc. ASPEED Graphics Family"});
    const auto guest = instancesOf<VideoControllerProvider>("virtual");
    ASSERT_EQ(guest.size(), 1U);
    expectProperties(guest[0], {{"DeviceID", "0000:00:01.0"},
                                {"Name", "1af4:1050"},
                                {"VideoProcessor", "null"},
                                {"Driver", "virtio-pci"}});
    const auto board = instancesOf<VideoControllerProvider>("arm");
    ASSERT_EQ(board.size(), 2U);
    expectProperties(board[0], {{"DeviceID", "card0"}, {"VideoProcessor", "brcm,2711-v3d"}});
    expectProperties(board[1], {{"DeviceID", "card1"},
                                {"Name", "brcm,bcm2711-vc5"},
                                {"VideoProcessor", "brcm,bcm2711-vc5"},
                                {"HardwareId", "null"},
                                {"VendorName", "null"},
                                {"Driver", "vc4-drm"}});
}

TEST(DevicesMachines, monitorsOfTheLaptop) {
    const auto monitors = instancesOf<DesktopMonitorProvider>("laptop");
    ASSERT_EQ(monitors.size(), 2U);
    expectProperties(monitors[0], {{"DeviceID", "card0-DP-2"},
                                   {"CreationClassName", "Velmira_DesktopMonitor"},
                                   {"Caption", "DELL U2719D"},
                                   {"Name", "DELL U2719D"},
                                   {"EnabledState", "3"},
                                   {"OperationalStatus", "null"},
                                   {"DisplayType", "2"},
                                   {"ScreenWidth", "2560"},
                                   {"ScreenHeight", "1440"},
                                   {"MakerCode", "DEL"},
                                   {"ProductCode", "A0C4"},
                                   {"Model", "DELL U2719D"},
                                   {"SerialNumber", "CN0J5H1Q74"},
                                   {"YearOfManufacture", "2019"},
                                   {"WeekOfManufacture", "33"},
                                   {"WidthMillimetres", "597"},
                                   {"HeightMillimetres", "336"},
                                   // The root of 597^2 + 336^2 is 685.06; by 25.4 that is 26.97.
                                   {"DiagonalInches", "27.0"}});
    expectProperties(monitors[1], {{"DeviceID", "card0-eDP-1"},
                                   {"Model", "LG Display LP140WU1-SPB1"},
                                   {"EnabledState", "2"},
                                   {"DisplayType", "null"},
                                   {"ScreenWidth", "1920"},
                                   {"ScreenHeight", "1200"},
                                   {"MakerCode", "LGD"},
                                   {"ProductCode", "0665"},
                                   {"SerialNumber", "null"},
                                   {"YearOfManufacture", "2020"},
                                   {"WeekOfManufacture", "null"},
                                   // The root of 302^2 + 188^2 is 355.74; by 25.4 that is 14.01.
                                   {"DiagonalInches", "14.0"}});
}

TEST(DevicesMachines, monitorsOfTheOthers) {
    const auto console = instancesOf<DesktopMonitorProvider>("server");
    ASSERT_EQ(console.size(), 1U);
    expectProperties(console[0], {{"DeviceID", "card0-VGA-1"},
                                  {"Model", "HP 1530"},
                                  {"MakerCode", "HWP"},
                                  {"SerialNumber", "null"},
                                  {"DisplayType", "null"},
                                  {"ScreenWidth", "1024"},
                                  {"ScreenHeight", "768"},
                                  {"YearOfManufacture", "2004"},
                                  {"WeekOfManufacture", "12"}});
    const auto guest = instancesOf<DesktopMonitorProvider>("virtual");
    ASSERT_EQ(guest.size(), 1U);
    expectProperties(guest[0], {{"DeviceID", "card0-Virtual-1"},
                                {"Model", "QEMU Monitor"},
                                {"MakerCode", "RHT"},
                                {"ProductCode", "1234"},
                                {"SerialNumber", "null"},
                                {"DisplayType", "2"}});
    const auto television = instancesOf<DesktopMonitorProvider>("arm");
    ASSERT_EQ(television.size(), 1U);
    expectProperties(television[0], {{"DeviceID", "card1-HDMI-A-1"},
                                     {"Model", "SAMSUNG"},
                                     // 0x01000E00.
                                     {"SerialNumber", "16780800"},
                                     {"DisplayType", "4"},
                                     {"ScreenWidth", "1920"},
                                     {"ScreenHeight", "1080"},
                                     {"YearOfManufacture", "null"},
                                     {"WeekOfManufacture", "null"},
                                     {"ModelYear", "2015"},
                                     {"Made", "model 2015"},
                                     {"WidthMillimetres", "890"},
                                     {"HeightMillimetres", "500"},
                                     // The root of 890^2 + 500^2 is 1020.83; by 25.4 that is 40.19.
                                     {"DiagonalInches", "40.2"}});
}

TEST(DevicesMachines, batteries) {
    const auto batteries = instancesOf<BatteryProvider>("laptop");
    ASSERT_EQ(batteries.size(), 1U);
    expectProperties(batteries[0], {{"DeviceID", "BAT0"},
                                    {"CreationClassName", "Velmira_Battery"},
                                    {"Name", "BAT0"},
                                    {"Caption", "LGC 5B10W13974"},
                                    {"OperationalStatus", "null"},
                                    {"EnabledState", "5"},
                                    {"BatteryStatus", "11"},
                                    {"Chemistry", "8"},
                                    {"DesignCapacity", "57020"},
                                    {"FullChargeCapacity", "51350"},
                                    {"DesignVoltage", "15440"},
                                    {"EstimatedChargeRemaining", "87"},
                                    {"Manufacturer", "LGC"},
                                    {"Model", "5B10W13974"},
                                    {"SerialNumber", "1274"},
                                    {"CycleCount", "142"}});
    for (const char* name : {"server", "virtual", "arm"})
        EXPECT_EQ(absenceOn<BatteryProvider>(name), Absence::Absent) << name;
}

TEST(DevicesMachines, sensorsOfTheLaptop) {
    EXPECT_EQ(
        valuesOn<NumericSensorProvider>("laptop", "DeviceID"),
        (Texts{"BAT0@BAT0/in0", "acpitz@thermal_zone0/temp1", "coretemp@coretemp.0/temp1",
               "coretemp@coretemp.0/temp2", "nvme@nvme0/temp1", "thinkpad@thinkpad_hwmon/temp1",
               "thinkpad@thinkpad_hwmon/temp2", "thinkpad@thinkpad_hwmon/fan1"}));
    EXPECT_EQ(
        valuesOn<NumericSensorProvider>("laptop", "ReadingText"),
        (Texts{"16.218 V", "43.0 C", "46.0 C", "45.0 C", "38.9 C", "44.0 C", "0.0 C", "2731 RPM"}));
    const auto sensors = instancesOf<NumericSensorProvider>("laptop");
    expectProperties(sensors[2], {{"CreationClassName", "Velmira_NumericSensor"},
                                  {"Name", "coretemp Package id 0"},
                                  {"OperationalStatus", "2 "},
                                  {"EnabledState", "5"},
                                  {"SensorType", "2"},
                                  {"BaseUnits", "2"},
                                  {"UnitModifier", "-3"},
                                  {"CurrentReading", "46000"},
                                  {"LowerThresholdNonCritical", "null"},
                                  {"UpperThresholdNonCritical", "100000"},
                                  {"LowerThresholdCritical", "null"},
                                  {"UpperThresholdCritical", "100000"},
                                  {"UpperThresholdFatal", "null"}});
    // Drives without a lower limit give absolute zero for one.
    expectProperties(sensors[4], {{"LowerThresholdNonCritical", "null"},
                                  {"UpperThresholdNonCritical", "84850"},
                                  {"CurrentReading", "38850"}});
    expectProperties(sensors[7], {{"SensorType", "5"},
                                  {"BaseUnits", "19"},
                                  {"UnitModifier", "0"},
                                  {"CurrentReading", "2731"}});
}

TEST(DevicesMachines, sensorsOfTheServer) {
    EXPECT_EQ(
        valuesOn<NumericSensorProvider>("server", "DeviceID"),
        (Texts{"coretemp@coretemp.0/temp1", "coretemp@coretemp.1/temp1",
               "nct6779@nct6775.2592/temp1", "nct6779@nct6775.2592/temp2",
               "nct6779@nct6775.2592/fan1", "nct6779@nct6775.2592/fan2",
               "nct6779@nct6775.2592/fan10", "nct6779@nct6775.2592/in0", "nct6779@nct6775.2592/in7",
               "pfe1100@7-0058/in1", "pfe1100@7-0058/curr1", "pfe1100@7-0058/power1"}));
    const auto sensors = instancesOf<NumericSensorProvider>("server");
    ASSERT_EQ(sensors.size(), 12U);
    expectProperties(sensors[3], {{"OperationalStatus", "6 "}, {"ReadingText", "-62.0 C"}});
    expectProperties(sensors[7], {{"SensorType", "3"},
                                  {"BaseUnits", "5"},
                                  {"UnitModifier", "-3"},
                                  {"CurrentReading", "888"},
                                  {"LowerThresholdNonCritical", "0"},
                                  {"UpperThresholdNonCritical", "1744"}});
    expectProperties(sensors[8], {{"Name", "nct6779 3VSB"}, {"ReadingText", "3.312 V"}});
    expectProperties(sensors[10],
                     {{"SensorType", "4"}, {"BaseUnits", "6"}, {"ReadingText", "0.680 A"}});
    expectProperties(sensors[11], {{"SensorType", "13"},
                                   {"BaseUnits", "7"},
                                   {"UnitModifier", "-3"},
                                   {"CurrentReading", "152000"},
                                   {"UpperThresholdNonCritical", "1200000"},
                                   {"ReadingText", "152.0 W"}});
}

TEST(DevicesMachines, sensorsOfTheOthers) {
    EXPECT_EQ(valuesOn<NumericSensorProvider>("arm", "DeviceID"),
              Texts{"cpu_thermal@thermal_zone0/temp1"});
    EXPECT_EQ(valuesOn<NumericSensorProvider>("arm", "ReadingText"), Texts{"48.2 C"});
    EXPECT_EQ(absenceOn<NumericSensorProvider>("virtual"), Absence::Absent);
}

TEST(DevicesMachines, fans) {
    const auto laptop = instancesOf<FanProvider>("laptop");
    ASSERT_EQ(laptop.size(), 1U);
    expectProperties(laptop[0], {{"DeviceID", "thinkpad@thinkpad_hwmon/fan1"},
                                 {"CreationClassName", "Velmira_Fan"},
                                 {"Name", "thinkpad fan1"},
                                 {"OperationalStatus", "2 "},
                                 {"EnabledState", "5"},
                                 {"ActiveCooling", "TRUE"},
                                 {"VariableSpeed", "TRUE"},
                                 {"DesiredSpeed", "null"},
                                 {"SpeedRPM", "2731"}});
    EXPECT_EQ(valuesOn<FanProvider>("server", "SpeedRPM"), (Texts{"5273", "210", "0"}));
    EXPECT_EQ(valuesOn<FanProvider>("server", "DesiredSpeed"), (Texts{"5200", "null", "null"}));
    EXPECT_EQ(valuesOn<FanProvider>("server", "OperationalStatus"), (Texts{"2 ", "3 ", "10 "}));
    EXPECT_EQ(valuesOn<FanProvider>("server", "VariableSpeed"), (Texts{"TRUE", "TRUE", "null"}));
    EXPECT_EQ(absenceOn<FanProvider>("virtual"), Absence::Absent);
    EXPECT_EQ(absenceOn<FanProvider>("arm"), std::nullopt);
}

TEST(DevicesMachines, serveWhatTheSchemaDeclares) {
    for (const char* name : {"laptop", "server", "virtual", "arm"}) {
        SCOPED_TRACE(name);
        expectServesItsClass(UsbDeviceProvider(machine(name)));
        expectServesItsClass(VideoControllerProvider(machine(name)));
        expectServesItsClass(DesktopMonitorProvider(machine(name)));
    }
    for (const char* name : {"laptop", "server", "virtual"})
        expectServesItsClass(PciDeviceProvider(machine(name)));
    for (const char* name : {"laptop", "server"}) {
        expectServesItsClass(providerOf<FanProvider>(name));
        expectServesItsClass(providerOf<NumericSensorProvider>(name));
    }
    expectServesItsClass(providerOf<NumericSensorProvider>("arm"));
    expectServesItsClass(providerOf<BatteryProvider>("laptop"));
}

}  // namespace
}  // namespace cimomd
