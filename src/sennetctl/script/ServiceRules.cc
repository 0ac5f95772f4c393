#include "script/ServiceRules.h"

#include <map>
#include <sstream>

#include "script/ProgramOutput.h"

namespace sennetctl {

namespace {

/// The first value of each property: the service comes before the timer, of which only
/// UnitFileState is asked.
std::map<std::string, std::string> propertiesIn(std::string_view text) {
    std::map<std::string, std::string> properties;
    bool isTimer = false;
    std::istringstream lines{std::string(text)};
    for (std::string line; std::getline(lines, line);) {
        const std::size_t separator = line.find('=');
        if (separator == std::string::npos) {
            isTimer = true;
        } else {
            properties.try_emplace((isTimer ? "timer." : "") + line.substr(0, separator),
                                   line.substr(separator + 1));
        }
    }
    return properties;
}

std::vector<std::string> wordsIn(const std::string& text) {
    std::vector<std::string> words;
    std::istringstream stream(text);
    for (std::string word; stream >> word;) {
        words.push_back(word);
    }
    return words;
}

std::vector<std::string> writablePaths(std::map<std::string, std::string>& properties) {
    std::vector<std::string> paths;
    for (const std::string& word : wordsIn(properties["ReadWritePaths"])) {
        const std::size_t begin = word.find_first_not_of("-+");
        if (begin != std::string::npos) {
            paths.push_back(word.substr(begin));
        }
    }
    for (const std::string& word : wordsIn(properties["StateDirectory"])) {
        paths.push_back("/var/lib/" + word.substr(0, word.find(':')));
    }
    return paths;
}

}  // namespace

std::optional<ServiceRules> parseServiceRules(std::string_view text) {
    std::map<std::string, std::string> properties = propertiesIn(text);
    const std::string& user = properties["User"];
    if (properties["LoadState"] != "loaded" || (!user.empty() && user != "root" && user != "0")) {
        return std::nullopt;
    }
    ServiceRules rules;
    rules.isScheduled = properties["timer.UnitFileState"].rfind("enabled", 0) == 0;
    rules.isReadOnly = properties["ProtectSystem"] == "strict";
    rules.isOverriding =
        properties["CapabilityBoundingSet"].find("cap_dac_override") != std::string::npos;
    rules.writable = writablePaths(properties);
    return rules;
}

std::optional<ServiceRules> askServiceRules(const char* product) {
    const std::string unit = std::string("sennet@") + product;
    constexpr unsigned kPatienceSeconds = 10;
    const std::string asked =
        "LoadState,User,ProtectSystem,CapabilityBoundingSet,ReadWritePaths,StateDirectory,"
        "UnitFileState";
    return parseServiceRules(outputOf(
        {"systemctl", "show", "-p", asked, unit + ".service", unit + ".timer"}, kPatienceSeconds));
}

}  // namespace sennetctl
