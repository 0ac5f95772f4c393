#include "providers/devices/VideoControllerProvider.h"

#include "providers/EnumeratedValues.h"
#include "providers/InstanceBuilder.h"
#include "providers/Megabytes.h"
#include "providers/RecordStream.h"
#include "providers/devices/HardwareTitle.h"
#include "system/computer/SystemIdentity.h"

namespace cimomd {
namespace {

using Pegasus::Uint16;
using Pegasus::Uint32;

}  // namespace

std::unique_ptr<InstanceStream> VideoControllerProvider::enumerate() const {
    auto controllers = readVideoControllers(paths);
    if (!controllers)
        return std::make_unique<EmptyStream>(controllers.reason());
    const std::string hostName = readHostName(paths);
    return std::make_unique<RecordStream<VideoController>>(
        *controllers,
        [hostName](const VideoController& controller) { return publish(hostName, controller); });
}

ProvidedInstance VideoControllerProvider::publish(const std::string& hostName,
                                                  const VideoController& controller) {
    const Fact<std::string> hardwareId = hardwareIdOf(controller.vendor, controller.device);
    const std::string title =
        titleOf(controller.vendorName, controller.processor, hardwareId.value_or(controller.id));
    InstanceBuilder builder(kClassName);
    builder.label(title)
        .text("Name", title, kNameLength)
        .values<Uint16>("OperationalStatus", Absence::Absent)
        .value<Uint16>("EnabledState", kStateNotApplicable)
        .deviceKeys(hostName, controller.id)
        .text("VideoProcessor", controller.processor)
        .text("HardwareId", hardwareId)
        .text("VendorName", controller.vendorName)
        .text("Driver", controller.driver)
        .value<Uint32>("VideoMemoryMB", megabytesOf(controller.memoryBytes));
    return builder.take();
}

}  // namespace cimomd
