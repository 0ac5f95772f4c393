#include "providers/processor/ProcessorProvider.h"

#include <fmt/format.h>

#include "files/TextFile.h"
#include "providers/EnumeratedValues.h"
#include "providers/InstanceBuilder.h"
#include "providers/RecordStream.h"
#include "providers/processor/ProcessorNumbers.h"
#include "system/computer/SystemIdentity.h"

namespace cimomd {
namespace {

using Pegasus::Uint16;
using Pegasus::Uint32;

// A line of flags takes more than a kilobyte, and there are machines with thousands of threads.
constexpr std::size_t kMaxCpuInfoBytes = std::size_t{64} << 20;

// CIM_Processor.CPUStatus
constexpr Uint16 kCpuEnabled = 1;
constexpr Uint16 kCpuDisabledByFirmware = 3;

constexpr std::size_t kFamilyTextLength = 64;
constexpr std::size_t kManufacturerLength = 64;
constexpr std::size_t kTextLength = 256;

/// A field of the socket, or the reason for which the socket is not known.
template <typename T>
Fact<T> ofSocket(const InstalledProcessor& processor, Fact<T> ProcessorSocket::*field) {
    if (!processor.socket)
        return processor.socket.reason();
    return (*processor.socket).*field;
}

/// A field of the package, else the socket's.
Fact<std::string> textOf(const InstalledProcessor& processor,
                         std::optional<std::string> ProcessorPackage::*field,
                         Fact<std::string> ProcessorSocket::*fallback) {
    const Fact<std::string> own =
        processor.package ? (*processor.package).*field : std::optional<std::string>();
    return own.orElse(ofSocket(processor, fallback));
}

Fact<Uint32> clockOf(const InstalledProcessor& processor,
                     std::optional<std::uint32_t> ProcessorPackage::*field,
                     Fact<std::uint16_t> ProcessorSocket::*fallback) {
    const Fact<Uint32> own =
        processor.package ? (*processor.package).*field : std::optional<std::uint32_t>();
    return own.orElse(
        ofSocket(processor, fallback).then([](std::uint16_t mhz) { return Uint32{mhz}; }));
}

template <typename T>
std::optional<T> ofPackage(const InstalledProcessor& processor,
                           std::optional<T> ProcessorPackage::*field) {
    return processor.package ? (*processor.package).*field : std::nullopt;
}

/// Without a number of the firmware, or with one that the standard does not list, the model's name
/// stands for the family.
Fact<Uint16> familyOf(const InstalledProcessor& processor, const Fact<std::string>& model) {
    const Fact<Uint16> listed =
        ofSocket(processor, &ProcessorSocket::family).then([](std::uint16_t family) {
            return processorFamilyOf(family);
        });
    return listed.orElse(model.then([](const std::string&) { return kProcessorOther; }));
}

std::string deviceIdOf(const InstalledProcessor& processor) {
    if (processor.package)
        return fmt::format("CPU{}", processor.package->number);
    return fmt::format("SOCKET{}", processor.socket.value().number);
}

Uint16 operationalStatusOf(Uint16 cpuStatus) {
    if (cpuStatus == kCpuEnabled)
        return kOperationalOk;
    return cpuStatus == kCpuDisabledByFirmware ? kOperationalError : kOperationalStopped;
}

void describeModel(InstanceBuilder& builder, const InstalledProcessor& processor) {
    const Fact<std::string> model =
        textOf(processor, &ProcessorPackage::model, &ProcessorSocket::version);
    const Fact<Uint16> family = familyOf(processor, model);
    builder.label(model.value_or(deviceIdOf(processor)))
        .value<Uint16>("Family", family)
        .text("OtherFamilyDescription", family == kProcessorOther ? model : Absence::Absent,
              kFamilyTextLength)
        .text("Manufacturer",
              textOf(processor, &ProcessorPackage::vendor, &ProcessorSocket::manufacturer),
              kManufacturerLength)
        .text("Model", model, kTextLength)
        .text("Stepping", ofPackage(processor, &ProcessorPackage::stepping));
}

void describeSocket(InstanceBuilder& builder, const InstalledProcessor& processor) {
    builder
        .value<Uint16>("UpgradeMethod",
                       ofSocket(processor, &ProcessorSocket::upgrade).then(upgradeMethodOf))
        .value<Uint32>(
            "ExternalBusClockSpeed",
            ofSocket(processor, &ProcessorSocket::externalClockMHz).then([](std::uint16_t mhz) {
                return Uint32{mhz};
            }))
        .text("SocketDesignation", ofSocket(processor, &ProcessorSocket::designation), kTextLength)
        .text("SerialNumber", ofSocket(processor, &ProcessorSocket::serialNumber), kTextLength)
        .text("PartNumber", ofSocket(processor, &ProcessorSocket::partNumber), kTextLength);
}

Fact<std::vector<ProcessorSocket>> readSockets(const SystemPaths& paths) {
    return readSmbiosTable(paths).then(processorSockets);
}

}  // namespace

std::unique_ptr<InstanceStream> ProcessorProvider::enumerate() const {
    const auto text = readText(paths.processors(), kMaxCpuInfoBytes);
    const std::vector<ProcessorPackage> packages = groupByPackage(
        readLogicalProcessors(paths.logicalProcessors()), parseCpuInfo(text.value_or("")));
    // Something must be running this.
    std::optional<Absence> incompleteness;
    if (packages.empty())
        incompleteness = text ? Absence::Unreadable : text.reason();
    const std::string hostName = readHostName(paths);
    return std::make_unique<RecordStream<InstalledProcessor>>(
        installedProcessors(packages, readSockets(paths)),
        [hostName](const InstalledProcessor& processor) { return publish(hostName, processor); },
        incompleteness);
}

ProvidedInstance ProcessorProvider::publish(const std::string& hostName,
                                            const InstalledProcessor& processor) {
    const std::string deviceId = deviceIdOf(processor);
    const Uint16 status = processor.package ? kCpuEnabled : Uint16{processor.socket->status};
    const auto width = ofPackage(processor, &ProcessorPackage::width);
    const auto threads =
        processor.package ? Fact<Uint16>(processor.package->threads) : Fact<Uint16>();
    InstanceBuilder builder(kClassName);
    describeModel(builder, processor);
    builder.text("Name", deviceId)
        .values<Uint16>("OperationalStatus", {operationalStatusOf(status)})
        .value<Uint16>("EnabledState", status == kCpuEnabled ? kEnabled : kDisabled)
        .deviceKeys(hostName, deviceId)
        .value<Uint32>("MaxClockSpeed",
                       clockOf(processor, &ProcessorPackage::maxMHz, &ProcessorSocket::maxMHz))
        .value<Uint32>("CurrentClockSpeed", clockOf(processor, &ProcessorPackage::currentMHz,
                                                    &ProcessorSocket::currentMHz))
        .value<Uint16>("DataWidth", width)
        .value<Uint16>("AddressWidth", width)
        .value<Uint16>("CPUStatus", status)
        .value<Uint16>("NumberOfEnabledCores", ofPackage(processor, &ProcessorPackage::cores))
        .value<Uint16>("NumberOfEnabledThreads", threads);
    describeSocket(builder, processor);
    return builder.take();
}

}  // namespace cimomd
