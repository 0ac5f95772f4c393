#include "providers/computer/PhysicalMemoryProvider.h"

#include <fmt/format.h>

#include <array>

#include "files/TextFile.h"
#include "providers/Megabytes.h"
#include "providers/PhysicalElement.h"
#include "providers/RecordStream.h"
#include "system/software/KernelTables.h"

namespace cimomd {
namespace {

using Pegasus::Uint16;
using Pegasus::Uint32;
using Pegasus::Uint64;

constexpr std::size_t kBankLabelLength = 64;

// CIM_PhysicalMemory.MemoryType and CIM_Chip.FormFactor
constexpr Uint16 kUnknown = 0;
constexpr Uint16 kOther = 1;

/// One kind of memory: its name, and its number in CIM_PhysicalMemory.MemoryType.
struct MemoryKind {
    const char* name = nullptr;
    Uint16 cimNumber = kOther;
};

/// By the number of DSP0134.
constexpr std::array<MemoryKind, 37> kMemoryKinds{{{},
                                                   {},
                                                   {nullptr, kUnknown},
                                                   {"DRAM", 2},
                                                   {"EDRAM", 6},
                                                   {"VRAM", 7},
                                                   {"SRAM", 8},
                                                   {"RAM", 9},
                                                   {"ROM", 10},
                                                   {"Flash", 11},
                                                   {"EEPROM", 12},
                                                   {"FEPROM", 13},
                                                   {"EPROM", 14},
                                                   {"CDRAM", 15},
                                                   {"3DRAM", 16},
                                                   {"SDRAM", 17},
                                                   {"SGRAM", 18},
                                                   {"RDRAM", 19},
                                                   {"DDR", 20},
                                                   {"DDR2", 21},
                                                   {"DDR2 FB-DIMM", 23},
                                                   {},
                                                   {},
                                                   {},
                                                   {"DDR3", 24},
                                                   {"FBD2", 25},
                                                   {"DDR4", 26},
                                                   {"LPDDR", 27},
                                                   {"LPDDR2", 28},
                                                   {"LPDDR3", 29},
                                                   {"LPDDR4", 30},
                                                   {"Logical non-volatile device"},
                                                   {"HBM"},
                                                   {"HBM2"},
                                                   {"DDR5"},
                                                   {"LPDDR5"},
                                                   {"HBM3"}}};

/// CIM_Chip.FormFactor by the number of DSP0134.
constexpr std::array<Uint16, 16> kFormFactors{kOther, kOther, kUnknown, 7,      2,  kOther, 3,  4,
                                              6,      8,      9,        kOther, 11, 12,     13, 8};

/// Kinds that are newer than the list are other ones; 0 is none.
std::optional<MemoryKind> kindOf(std::uint8_t type) {
    if (type == 0)
        return std::nullopt;
    return type < kMemoryKinds.size() ? kMemoryKinds[type] : MemoryKind{};
}

std::optional<Uint16> formFactorOf(std::uint8_t form) {
    if (form == 0)
        return std::nullopt;
    return form < kFormFactors.size() ? kFormFactors[form] : kOther;
}

Fact<std::string> descriptionOf(const MemoryDevice& device) {
    if (!device.describedByFirmware)
        return std::string("All memory that the kernel uses; the firmware describes no modules");
    return device.type.then(kindOf).then([](const MemoryKind& kind) {
        return kind.name == nullptr ? std::nullopt : std::optional<std::string>(kind.name);
    });
}

PhysicalElement elementOf(const MemoryDevice& device) {
    PhysicalElement element;
    element.tag = device.describedByFirmware ? fmt::format("Memory Device {}", device.socketNumber)
                                             : "Main Memory";
    element.title = device.locator.value_or(element.tag);
    element.name = device.locator;
    element.manufacturer = device.manufacturer;
    element.serialNumber = device.serialNumber;
    element.partNumber = device.partNumber;
    element.assetTag = device.assetTag;
    return element;
}

/// The standard lets only one of Speed and MaxMemorySpeed count, and this says which one.
Fact<bool> speedIsInMHz(const MemoryDevice& device) {
    return device.maxSpeedMHz.then([](std::uint32_t) { return true; });
}

}  // namespace

std::unique_ptr<InstanceStream> PhysicalMemoryProvider::enumerate() const {
    const Fact<SmbiosTable> table = readSmbiosTable(paths);
    // Tables that are there but cannot be read describe modules: what the kernel says in all would
    // be a guess about them.
    if (!table && table.reason() != Absence::Absent)
        return std::make_unique<EmptyStream>(table.reason());
    std::vector<MemoryDevice> devices;
    if (table)
        devices = memoryDevicesOf(*table);
    if (devices.empty()) {
        const Fact<std::uint64_t> totalKB = readTotalMemoryKB(paths);
        if (!totalKB)
            return std::make_unique<EmptyStream>(totalKB.reason());
        devices.push_back(memoryOfKernel(*totalKB));
    }
    return std::make_unique<RecordStream<MemoryDevice>>(std::move(devices), publish);
}

ProvidedInstance PhysicalMemoryProvider::publish(const MemoryDevice& device) {
    InstanceBuilder builder(kClassName);
    addPhysicalElement(builder, elementOf(device));
    addRemovability(builder, {});
    builder.enumerated("FormFactor", device.formFactor.then(formFactorOf))
        .value<Uint16>("MemoryType", device.type.then(kindOf).then(
                                         [](const MemoryKind& kind) { return kind.cimNumber; }))
        .value<Uint16>("TotalWidth", device.totalWidthBits)
        .value<Uint16>("DataWidth", device.dataWidthBits)
        .value<Uint32>("Speed", Absence::Absent)
        .value<Uint64>("Capacity", device.capacityBytes)
        .text("BankLabel", device.bankLabel, kBankLabelLength)
        .value<Pegasus::Boolean>("IsSpeedInMhz", speedIsInMHz(device))
        .value<Uint32>("MaxMemorySpeed", device.maxSpeedMHz)
        .value<Uint32>("ConfiguredMemoryClockSpeed", device.configuredSpeedMHz)
        .text("Description", descriptionOf(device))
        .value<Uint32>("CapacityMB", megabytesOf(device.capacityBytes))
        .text("DataSource", device.describedByFirmware ? "SMBIOS" : "Kernel");
    return builder.take();
}

}  // namespace cimomd
