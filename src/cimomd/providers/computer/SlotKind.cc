#include "providers/computer/SlotKind.h"

#include <fmt/format.h>

#include <array>

namespace cimomd {
namespace {

// CIM_PhysicalConnector.ConnectorLayout
constexpr std::uint16_t kUnknownLayout = 0;
constexpr std::uint16_t kOtherLayout = 1;
constexpr std::uint16_t kAnySlot = 7;
constexpr std::uint16_t kPci = 16;
constexpr std::uint16_t kPciX = 17;
constexpr std::uint16_t kPciExpress = 18;

/// The lanes that the types of one generation of PCI Express tell, in their order; 0: none told.
constexpr std::array<unsigned, 6> kLanes{0, 1, 2, 4, 8, 16};

struct PciExpressSlot {
    unsigned generation = 1;
    unsigned lanesIndex = 0;
};

/// Each generation has six types in a row, but a gap before the fourth.
std::optional<PciExpressSlot> pciExpressOf(std::uint8_t type) {
    constexpr unsigned kFirst = 0xA5;
    constexpr unsigned kFourth = 0xB8;
    constexpr unsigned kSixth = 0xC4;
    constexpr unsigned kGap = kFourth - 1;
    if (type < kFirst || type > kSixth || type == kGap)
        return std::nullopt;
    const auto perGeneration = static_cast<unsigned>(kLanes.size());
    if (type < kFourth)
        return PciExpressSlot{1 + (type - kFirst) / perGeneration, (type - kFirst) % perGeneration};
    return PciExpressSlot{4 + (type - kFourth) / perGeneration, (type - kFourth) % perGeneration};
}

std::string nameOf(const PciExpressSlot& slot) {
    const unsigned lanes = kLanes[slot.lanesIndex];
    const std::string name = fmt::format("PCI Express {}", slot.generation);
    return lanes == 0 ? name : fmt::format("{} x{}", name, lanes);
}

/// The types up to the first gap.
constexpr std::array<const char*, 0x29> kNames{nullptr,
                                               nullptr,
                                               nullptr,
                                               "ISA",
                                               "MCA",
                                               "EISA",
                                               "PCI",
                                               "PC Card",
                                               "VESA local bus",
                                               "Proprietary",
                                               "Processor card",
                                               "Memory card",
                                               "I/O riser",
                                               "NuBus",
                                               "PCI 66 MHz",
                                               "AGP",
                                               "AGP 2x",
                                               "AGP 4x",
                                               "PCI-X",
                                               "AGP 8x",
                                               "M.2 socket 1-DP",
                                               "M.2 socket 1-SD",
                                               "M.2 socket 2",
                                               "M.2 socket 3",
                                               "MXM type I",
                                               "MXM type II",
                                               "MXM type III",
                                               "MXM type III-HE",
                                               "MXM type IV",
                                               "MXM 3.0 type A",
                                               "MXM 3.0 type B",
                                               "U.2 PCI Express 2",
                                               "U.2 PCI Express 3",
                                               "Mini PCI Express",
                                               "Mini PCI Express",
                                               "Mini PCI Express",
                                               "U.2 PCI Express 4",
                                               "U.2 PCI Express 5",
                                               "OCP NIC 3.0 SFF",
                                               "OCP NIC 3.0 LFF",
                                               "OCP NIC"};

}  // namespace

std::uint16_t connectorLayoutOf(std::uint8_t slotType) {
    constexpr std::uint8_t kOther = 0x01;
    constexpr std::uint8_t kUnknown = 0x02;
    constexpr std::uint8_t kPciSlot = 0x06;
    constexpr std::uint8_t kPci66Slot = 0x0E;
    constexpr std::uint8_t kPciXSlot = 0x12;
    switch (slotType) {
        case kOther:
            return kOtherLayout;
        case 0:
        case kUnknown:
            return kUnknownLayout;
        case kPciSlot:
        case kPci66Slot:
            return kPci;
        case kPciXSlot:
            return kPciX;
        default:
            break;
    }
    const std::optional<PciExpressSlot> slot = pciExpressOf(slotType);
    return slot ? static_cast<std::uint16_t>(kPciExpress + slot->lanesIndex) : kAnySlot;
}

std::optional<std::string> slotTypeName(std::uint8_t slotType) {
    if (const std::optional<PciExpressSlot> slot = pciExpressOf(slotType))
        return nameOf(*slot);
    if (slotType >= kNames.size() || kNames[slotType] == nullptr)
        return std::nullopt;
    return kNames[slotType];
}

std::optional<std::uint16_t> dataBitsOf(std::uint8_t dataBusWidth) {
    constexpr std::uint8_t k8Bits = 3;
    constexpr std::uint8_t k128Bits = 7;
    if (dataBusWidth < k8Bits || dataBusWidth > k128Bits)
        return std::nullopt;
    return static_cast<std::uint16_t>(8U << (dataBusWidth - k8Bits));
}

std::optional<std::uint16_t> lanesOf(std::uint8_t dataBusWidth) {
    constexpr std::uint8_t kOneLane = 8;
    constexpr std::array<std::uint16_t, 7> kWidths{1, 2, 4, 8, 12, 16, 32};
    if (dataBusWidth < kOneLane || dataBusWidth >= kOneLane + kWidths.size())
        return std::nullopt;
    return kWidths[dataBusWidth - kOneLane];
}

}  // namespace cimomd
