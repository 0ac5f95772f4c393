#include "providers/InstanceBuilder.h"

#include <fmt/format.h>

#include "providers/EnumeratedValues.h"
#include "text/CimText.h"
#include "text/Utf8.h"

namespace cimomd {

namespace {

using Pegasus::CIMValue;

/// FNV-1a of 32 bits: it must give the same number on every machine and in every version.
std::uint32_t checksumOf(std::string_view bytes) {
    constexpr std::uint32_t kOffset = 2166136261U;
    constexpr std::uint32_t kPrime = 16777619U;
    std::uint32_t sum = kOffset;
    for (const char byte : bytes)
        sum = (sum ^ static_cast<unsigned char>(byte)) * kPrime;
    return sum;
}

std::string shortKey(const std::string& value, std::size_t maxLength) {
    const std::string clean = cleanText(value);
    if (maxLength == 0 || firstCharacters(clean, maxLength).size() == clean.size())
        return clean;
    const std::string mark = fmt::format("~{:08x}", checksumOf(value));
    return std::string(firstCharacters(clean, maxLength - mark.size())) + mark;
}

}  // namespace

InstanceBuilder::InstanceBuilder(const char* className) : creationClass(className) {
    provided.instance = Pegasus::CIMInstance(Pegasus::CIMName(className));
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
    if (!provided.identity.empty())
        provided.identity += ',';
    provided.identity += cleanText(value);
    return text(name, shortKey(value, maxLength));
}

InstanceBuilder& InstanceBuilder::label(const std::string& title) {
    return text("Caption", title, kCaptionLength).text("ElementName", title);
}

InstanceBuilder& InstanceBuilder::text(const char* name, const Fact<std::string>& value,
                                       std::size_t maxLength) {
    if (!value)
        return addMissing(name, Pegasus::CIMTYPE_STRING, false, value.reason());
    const std::string clean = cleanText(*value);
    return add(name, CIMValue(cimString(maxLength == 0 ? std::string_view(clean)
                                                       : firstCharacters(clean, maxLength))));
}

InstanceBuilder& InstanceBuilder::texts(const char* name,
                                        const Fact<std::vector<std::string>>& values) {
    if (!values)
        return addMissing(name, Pegasus::CIMTYPE_STRING, true, values.reason());
    Pegasus::Array<Pegasus::String> array;
    for (const std::string& value : *values)
        array.append(cimString(cleanText(value)));
    return add(name, CIMValue(array));
}

InstanceBuilder& InstanceBuilder::add(const char* name, const CIMValue& value) {
    provided.instance.addProperty(Pegasus::CIMProperty(Pegasus::CIMName(name), value));
    return *this;
}

InstanceBuilder& InstanceBuilder::addMissing(const char* name, Pegasus::CIMType type, bool isArray,
                                             Absence reason) {
    provided.missing.push_back({name, reason});
    return add(name, CIMValue(type, isArray));
}

}  // namespace cimomd
