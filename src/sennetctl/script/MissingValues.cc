#include "script/MissingValues.h"

#include "cim/CimText.h"
#include "cim/ValueText.h"

namespace sennetctl {

using namespace Pegasus;

namespace {

std::string textIn(const CIMInstance& instance, const char* property) {
    const Uint32 position = instance.findProperty(CIMName(property));
    return position == PEG_NOT_FOUND ? std::string()
                                     : textOf(instance.getProperty(position).getValue().toString());
}

// Files of a process are for its owner and for root with all privileges, which no service of the
// packages has.
bool isOfProcesses(const std::string& className) {
    return className == "Velmira_UnixProcess";
}

/// What is to be done about a reason, or why nothing can be; empty for one that is not known here.
std::string meaningOf(const std::string& reason, const std::string& className) {
    static const std::map<std::string, std::string> kMeanings = {
        {"Absent", "the machine does not tell it"},
        {"Needs Root", "run as root or let the service run"},
        {"Filtered", "the maker left a placeholder"},
        {"Timed Out", "a file server or a driver does not answer"},
        {"Unreadable", "the source cannot be read or understood"},
    };
    if (reason == "Needs Root" && isOfProcesses(className)) {
        return ", run as root by hand, without the service";
    }
    const auto found = kMeanings.find(reason);
    return found == kMeanings.end() ? std::string() : ", " + found->second;
}

/// The name of the reason, and what it means.
std::string reasonIn(const CIMInstance& missing, const CIMClass& definition) {
    const Uint32 inInstance = missing.findProperty(CIMName("Reason"));
    const Uint32 inClass = definition.findProperty(CIMName("Reason"));
    if (inInstance == PEG_NOT_FOUND || inClass == PEG_NOT_FOUND) {
        return {};
    }
    const CIMProperty declared = CIMClass(definition).getProperty(inClass);
    constexpr std::size_t kLongestReason = 100;
    AnswerRoom room;
    const std::string name = ValueText(room).shown(missing.getProperty(inInstance).getValue(),
                                                   &declared, kLongestReason);
    return name + meaningOf(name, textIn(missing, "TargetClassName"));
}

}  // namespace

std::string MissingValues::reasonFor(const AnsweredClass& answered, const std::string& property) {
    const auto find = [&](const std::string& className) {
        const auto found = known().find({className, property});
        return found == known().end() ? std::string() : found->second;
    };
    for (const CIMInstance& instance : answered.instances) {
        std::string reason = find(textOf(instance.getClassName()));
        if (!reason.empty()) {
            return reason;
        }
    }
    return find(textOf(answered.definition.getClassName()));
}

const MissingValues::Reasons& MissingValues::known() {
    constexpr const char* kNamespace = "root/cimv2";
    constexpr const char* kClass = "Velmira_MissingValue";
    if (reasons) {
        return *reasons;
    }
    reasons.emplace();
    try {
        const CIMClass definition = server.getClass(kNamespace, kClass);
        for (const CIMInstance& missing : server.instances(kNamespace, kClass)) {
            reasons->insert({{textIn(missing, "TargetClassName"), textIn(missing, "PropertyName")},
                             reasonIn(missing, definition)});
        }
    } catch (const CIMException&) {
        // Other servers do not have this class.
        return *reasons;
    }
    return *reasons;
}

}  // namespace sennetctl
