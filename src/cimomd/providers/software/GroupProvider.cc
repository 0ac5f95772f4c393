#include "providers/software/GroupProvider.h"

#include "providers/EnumeratedValues.h"
#include "providers/InstanceBuilder.h"
#include "providers/RecordStream.h"

namespace cimomd {
namespace {

constexpr std::size_t kNumberLength = 256;

}  // namespace

std::unique_ptr<InstanceStream> GroupProvider::enumerate() const {
    Fact<std::vector<UserGroup>> groups = readUserGroups(paths.groups());
    if (!groups)
        return std::make_unique<EmptyStream>(groups.reason());
    return std::make_unique<RecordStream<UserGroup>>(std::move(*groups), publish);
}

ProvidedInstance GroupProvider::publish(const UserGroup& group) {
    InstanceBuilder builder(kClassName);
    builder.label(group.name)
        .text("CreationClassName", kClassName)
        .key("Name", group.name, kNameLength)
        .text("CommonName", group.name)
        .text("GroupID", std::to_string(group.groupId), kNumberLength)
        .texts("Members", group.members);
    return builder.take();
}

}  // namespace cimomd
