#include "providers/devices/DesktopMonitorProvider.h"

#include <fmt/format.h>

#include <cmath>

#include "providers/EnumeratedValues.h"
#include "providers/InstanceBuilder.h"
#include "providers/RecordStream.h"
#include "providers/devices/HardwareTitle.h"
#include "system/computer/SystemIdentity.h"

namespace cimomd {
namespace {

using Pegasus::Uint16;
using Pegasus::Uint32;
using Pegasus::Uint8;

// CIM_DesktopMonitor.DisplayType
constexpr Uint16 kMultiscanColour = 2;
constexpr Uint16 kMultiscanMonochrome = 3;
constexpr Uint16 kFixedFrequencyColour = 4;
constexpr Uint16 kFixedFrequencyMonochrome = 5;

constexpr double kMillimetresPerInch = 25.4;

/// One member of what the monitor tells, or why it tells nothing.
template <auto Member>
auto told(const Fact<Edid>& edid) {
    using Value = std::remove_cvref_t<decltype((*edid).*Member)>;
    return edid ? (*edid).*Member : Value(edid.reason());
}

Fact<Uint16> displayTypeOf(const Fact<Edid>& edid) {
    const Fact<bool> isColour = told<&Edid::isColour>(edid);
    return told<&Edid::hasFrequencyRange>(edid).then(
        [&](bool hasRange) -> std::optional<Uint16> {
            if (!isColour)
                return std::nullopt;
            if (hasRange)
                return *isColour ? kMultiscanColour : kMultiscanMonochrome;
            return *isColour ? kFixedFrequencyColour : kFixedFrequencyMonochrome;
        },
        isColour.reason());
}

/// The name, or what panels have in its place: maker and model as texts.
Fact<std::string> modelOf(const Fact<Edid>& edid) {
    Fact<std::string> name = told<&Edid::name>(edid);
    if (name || !edid || edid->texts.empty())
        return name;
    return fmt::format("{}", fmt::join(edid->texts, " "));
}

Fact<std::string> productCodeOf(const Fact<Edid>& edid) {
    return edid.then([](const Edid& found) { return fmt::format("{:04X}", found.productCode); });
}

Fact<std::string> diagonalOf(const Fact<Edid>& edid) {
    const Fact<std::uint32_t> width = told<&Edid::widthMillimetres>(edid);
    return told<&Edid::heightMillimetres>(edid).then(
        [&](std::uint32_t height) -> std::optional<std::string> {
            if (!width)
                return std::nullopt;
            return fmt::format("{:.1f}", std::hypot(*width, height) / kMillimetresPerInch);
        },
        width.reason());
}

/// A text, so that what is not known stays empty where numbers are printed.
Fact<std::string> madeOf(const Fact<Edid>& edid) {
    return edid.then(
        [](const Edid& found) -> std::optional<std::string> {
            if (found.modelYear)
                return fmt::format("model {}", *found.modelYear);
            if (!found.year)
                return std::nullopt;
            return found.week ? fmt::format("{}-W{:02}", *found.year, *found.week)
                              : std::to_string(*found.year);
        },
        edid ? told<&Edid::year>(edid).reason() : Absence::Absent);
}

Fact<Uint16> enabledStateOf(const Fact<bool>& isEnabled) {
    return isEnabled.then([](bool is) { return is ? kEnabled : kDisabled; });
}

}  // namespace

std::unique_ptr<InstanceStream> DesktopMonitorProvider::enumerate() const {
    auto monitors = readMonitors(paths.graphics());
    if (!monitors)
        return std::make_unique<EmptyStream>(monitors.reason());
    const std::string hostName = readHostName(paths);
    return std::make_unique<RecordStream<Monitor>>(
        *monitors, [hostName](const Monitor& monitor) { return publish(hostName, monitor); });
}

ProvidedInstance DesktopMonitorProvider::publish(const std::string& hostName,
                                                 const Monitor& monitor) {
    const Fact<Edid>& edid = monitor.edid;
    const Fact<std::string> model = modelOf(edid);
    const std::string title =
        model.value_or(titleOf(told<&Edid::makerCode>(edid), std::nullopt, monitor.connector));
    InstanceBuilder builder(kClassName);
    builder.label(title)
        .text("Name", title, kNameLength)
        .values<Uint16>("OperationalStatus", Absence::Absent)
        .value<Uint16>("EnabledState", enabledStateOf(monitor.isEnabled))
        .deviceKeys(hostName, monitor.connector)
        .value<Uint16>("DisplayType", displayTypeOf(edid))
        .value<Uint32>("ScreenWidth", told<&Edid::widthPixels>(edid))
        .value<Uint32>("ScreenHeight", told<&Edid::heightPixels>(edid))
        .text("MakerCode", told<&Edid::makerCode>(edid))
        .text("ProductCode", productCodeOf(edid))
        .text("Model", model)
        .text("SerialNumber", told<&Edid::serialNumber>(edid))
        .value<Uint16>("YearOfManufacture", told<&Edid::year>(edid))
        .value<Uint8>("WeekOfManufacture", told<&Edid::week>(edid))
        .value<Uint16>("ModelYear", told<&Edid::modelYear>(edid))
        .text("Made", madeOf(edid))
        .value<Uint32>("WidthMillimetres", told<&Edid::widthMillimetres>(edid))
        .value<Uint32>("HeightMillimetres", told<&Edid::heightMillimetres>(edid))
        .text("DiagonalInches", diagonalOf(edid));
    return builder.take();
}

}  // namespace cimomd
