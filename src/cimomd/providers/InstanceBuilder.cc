#include "providers/InstanceBuilder.h"

#include <fmt/format.h>

#include "model/InstanceBody.h"
#include "providers/EnumeratedValues.h"
#include "text/Utf8.h"

namespace cimomd {

namespace {

/// FNV-1a of 32 bits: it must give the same number on every machine and in every version.
std::uint32_t checksumOf(std::string_view bytes) {
    constexpr std::uint32_t kOffset = 2166136261U;
    constexpr std::uint32_t kPrime = 16777619U;
    std::uint32_t sum = kOffset;
    for (const char byte : bytes)
        sum = (sum ^ static_cast<unsigned char>(byte)) * kPrime;
    return sum;
}

/// `clean` is `value` as CIM-XML can carry it.
std::string shortened(std::string_view clean, const std::string& value, std::size_t maxLength) {
    const std::string mark = fmt::format("~{:08x}", checksumOf(value));
    return std::string(firstCharacters(clean, maxLength - mark.size())) + mark;
}

/// A thread for each connection, which makes instances by the thousand.
BuiltShapes& builtShapes() {
    static thread_local BuiltShapes shapes;
    return shapes;
}

constexpr std::size_t kUsualProperties = 32;
constexpr std::size_t kUsuallyMissing = 8;
constexpr std::size_t kUsualOctets = 512;

}  // namespace

InstanceBuilder::InstanceBuilder(const char* className) : creationClass(className) {
    properties.reserve(kUsualProperties);
    provided.missing.reserve(kUsuallyMissing);
    packer.reserve(kUsualOctets);
}

ProvidedInstance InstanceBuilder::take() {
    const BuiltShape& built = builtShapes().find(creationClass, properties);
    provided.instance = Pegasus::makeInstance(built.className, packer.finish(built.shape));
    return std::move(provided);
}

InstanceBuilder& InstanceBuilder::deviceKeys(const std::string& hostName,
                                             const std::string& deviceId) {
    return systemKeys(hostName).key("DeviceID", deviceId, kDeviceIdLength);
}

InstanceBuilder& InstanceBuilder::physicalKeys(const std::string& tag) {
    return text("CreationClassName", creationClass).key("Tag", tag, kSystemNameLength);
}

InstanceBuilder& InstanceBuilder::serviceKeys(const std::string& hostName,
                                              const std::string& name) {
    return systemKeys(hostName).key("Name", name, kSystemNameLength);
}

InstanceBuilder& InstanceBuilder::systemKeys(const std::string& hostName) {
    return text("SystemCreationClassName", kComputerSystemClass)
        .text("SystemName", hostName, kSystemNameLength)
        .text("CreationClassName", creationClass);
}

InstanceBuilder& InstanceBuilder::key(const char* name, const std::string& value,
                                      std::size_t maxLength) {
    std::string room;
    const std::string_view clean = cleanText(value, room);
    if (!provided.identity.empty())
        provided.identity += ',';
    provided.identity += clean;
    const bool fits = maxLength == 0 || firstCharacters(clean, maxLength).size() == clean.size();
    return fits ? addText(name, clean, 0) : addText(name, shortened(clean, value, maxLength), 0);
}

InstanceBuilder& InstanceBuilder::label(const std::string& title) {
    return text("Caption", title, kCaptionLength).text("ElementName", title);
}

InstanceBuilder& InstanceBuilder::text(const char* name, const Fact<std::string>& value,
                                       std::size_t maxLength) {
    if (!value)
        return addMissing(name, Pegasus::CIMTYPE_STRING, false, value.reason());
    return addText(name, *value, maxLength);
}

InstanceBuilder& InstanceBuilder::addText(const char* name, std::string_view value,
                                          std::size_t maxLength) {
    std::string room;
    const std::string_view clean = cleanText(value, room);
    properties.push_back({name, Pegasus::CIMTYPE_STRING, false});
    packer.beginScalar();
    packer.putText(maxLength == 0 ? clean : firstCharacters(clean, maxLength));
    return *this;
}

InstanceBuilder& InstanceBuilder::texts(const char* name,
                                        const Fact<std::vector<std::string>>& values) {
    if (!values)
        return addMissing(name, Pegasus::CIMTYPE_STRING, true, values.reason());
    properties.push_back({name, Pegasus::CIMTYPE_STRING, true});
    packer.beginArray(static_cast<Pegasus::Uint32>(values->size()));
    std::string room;
    for (const std::string& value : *values)
        packer.putText(cleanText(value, room));
    return *this;
}

InstanceBuilder& InstanceBuilder::addMissing(const char* name, Pegasus::CIMType type, bool isArray,
                                             Absence reason) {
    provided.missing.push_back({name, reason});
    properties.push_back({name, type, isArray});
    packer.beginNull();
    return *this;
}

}  // namespace cimomd
