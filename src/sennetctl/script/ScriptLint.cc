#include "script/ScriptLint.h"

#include <algorithm>
#include <filesystem>
#include <map>
#include <utility>

#include "script/ScriptText.h"

namespace sennetctl {

namespace {

constexpr const char* kGivenUp = ": sennet gives the whole script up";
constexpr const char* kBrokenOff =
    ": sennet breaks the MIF file off in its middle, for CA and QVE the file of all scripts";

struct Meaning {
    std::string text;
    const char* reason = nullptr;
};

/// The text without what often stands around it by mistake.
Meaning likelyMeant(const std::string& value) {
    Meaning meaning{value, nullptr};
    const auto strip = [&](const std::string& text, const char* reason) {
        if (text != meaning.text) {
            meaning = {text, reason};
        }
    };
    const auto end = [&](std::size_t position) {
        return meaning.text.substr(0, std::min(position, meaning.text.size()));
    };
    if (!meaning.text.empty() && meaning.text.back() == '\r') {
        strip(end(meaning.text.size() - 1),
              "the carriage return at the end of the file belongs to it");
    }
    strip(trimmed(meaning.text), "blanks beside it belong to it");
    strip(end(meaning.text.find_first_of("#;")), "a comment has a line of its own");
    meaning.text = trimmed(meaning.text);
    const std::size_t first = meaning.text.find_first_not_of("\"'");
    const std::size_t last = meaning.text.find_last_not_of("\"'");
    if (first != std::string::npos) {
        strip(meaning.text.substr(first, last - first + 1), "quotes belong to it");
    }
    return meaning;
}

/// Why the text is no name, and what to write; empty when nobody knows.
std::string adviceOn(const std::string& value, bool (*isLegal)(const std::string&)) {
    const Meaning meaning = likelyMeant(value);
    if (meaning.reason == nullptr || !isLegal(meaning.text)) {
        return {};
    }
    return std::string(", for ") + meaning.reason + "; write " + meaning.text;
}

class Checker {
  public:
    Checker(ScriptModel& model, std::vector<Finding>& findings)
        : model(model), findings(findings) {}

    void run() {
        checkFileName();
        for (std::size_t i = 0; i < model.slots.size(); ++i) {
            checkSlot(i);
        }
        const bool any = std::any_of(model.slots.begin(), model.slots.end(),
                                     [](const ScriptSlot& slot) { return slot.isUsed(); });
        if (!any && !model.givenUp) {
            add(Severity::Warning, {}, "the script names no class: nothing is written");
        }
    }

  private:
    void add(Severity severity, const ScriptText& place, const std::string& message) {
        findings.push_back({model.file, place.line, place.column, severity, message});
    }

    void giveUp(const ScriptText& place, const char* kind, bool (*isLegal)(const std::string&)) {
        model.givenUp = true;
        // What is only blanks has been told where it was read, but for what need not be used.
        if (!trimmed(place.value).empty() || &place == &model.defaultNamespace) {
            add(Severity::Error, place,
                "'" + place.value + "' is no name of a " + kind + adviceOn(place.value, isLegal) +
                    kGivenUp);
        }
    }

    void checkFileName() {
        const std::string& file = model.file;
        if (!isCalledScript(file)) {
            add(Severity::Warning, {},
                "the file's name does not end in .script.inv: sennet does not read it");
        } else if (std::filesystem::path(file).filename().string().size() == kScriptSuffix.size()) {
            add(Severity::Warning, {},
                "the file's name has nothing before .script.inv: for SMS and LANDesk sennet writes "
                "no file");
        }
    }

    void checkSlot(std::size_t number) {
        ScriptSlot& slot = model.slots[number];
        if (!slot.isUsed()) {
            for (const ScriptText* lost : {&slot.nameSpace, &slot.propertyList}) {
                if (lost->line > 0) {
                    add(Severity::Warning, *lost,
                        "line without effect: slot " + std::to_string(number) +
                            " has no class, which G[" + std::to_string(number) + "]= would name");
                }
            }
            return;
        }
        checkClass(slot, number);
        checkNamespace(slot);
        if (scriptTokens(slot.propertyList.value, ", ").empty()) {
            tellNoProperties(slot, number);
        }
        readProperties(slot);
        tellRepeated(slot);
    }

    void checkClass(const ScriptSlot& slot, std::size_t number) {
        const std::string& name = slot.className.value;
        if (!isLegalName(name)) {
            giveUp(slot.className, "class", isLegalName);
        }
        for (std::size_t i = 0; i < number; ++i) {
            if (sameIgnoringCase(model.slots[i].className.value, name)) {
                add(Severity::Warning, slot.className,
                    "slot " + std::to_string(i) +
                        " has this class, too: its property list is taken for both");
                return;
            }
        }
    }

    void checkNamespace(const ScriptSlot& slot) {
        const bool own = !slot.nameSpace.value.empty();
        const ScriptText& text = own ? slot.nameSpace : model.defaultNamespace;
        const bool isTold = !own && std::exchange(isDefaultUsed, true);
        if (!isTold && !isLegalNamespace(text.value)) {
            giveUp(text, "namespace", isLegalNamespace);
        }
    }

    void tellNoProperties(const ScriptSlot& slot, std::size_t number) {
        const bool isMissing = slot.propertyList.line == 0;
        add(Severity::Warning, isMissing ? slot.className : slot.propertyList,
            "slot " + std::to_string(number) + " has " + (isMissing ? "no" : "an empty") +
                " property list: its rows get an empty cell that no column is for");
    }

    void readProperties(ScriptSlot& slot) {
        const ScriptText& list = slot.propertyList;
        std::size_t begin = 0;
        for (const std::string& name : scriptTokens(list.value, ", ")) {
            begin = list.value.find(name, begin);
            ScriptText property = list;
            property.value = name;
            property.column += static_cast<unsigned>(begin);
            begin += name.size();
            if (name[0] == '#') {
                tellNoProperty(property, ", for a comment has a line of its own");
                return;
            }
            checkProperty(slot, property);
        }
    }

    void tellNoProperty(const ScriptText& property, const std::string& advice) {
        add(Severity::Error, property,
            "'" + property.value + "' is no name of a property" + advice + kBrokenOff);
    }

    void checkProperty(ScriptSlot& slot, const ScriptText& property) {
        if (!isLegalName(property.value)) {
            const char last = property.value.back();
            const bool separator = last == ',' || last == ' ';
            tellNoProperty(property,
                           separator ? ", for a comma or blank at the end of the line belongs to it"
                                     : adviceOn(property.value, isLegalName));
            return;
        }
        slot.properties.push_back(property);
    }

    /// At its second place, and once however often it is listed.
    void tellRepeated(const ScriptSlot& slot) {
        std::map<std::string, std::vector<const ScriptText*>> places;
        for (const ScriptText& property : slot.properties) {
            places[inSmallLetters(property.value)].push_back(&property);
        }
        for (const auto& [name, same] : places) {
            if (same.size() > 1) {
                const std::string count = std::to_string(same.size());
                const bool isPair = same.size() == 2;
                std::string message = "the property ";
                message.append(same[1]->value)
                    .append(" is listed ")
                    .append(isPair ? "twice, and so gets two" : count)
                    .append(isPair ? "" : " times, and so gets ")
                    .append(isPair ? "" : count);
                add(Severity::Warning, *same[1], message.append(" columns"));
            }
        }
    }

    ScriptModel& model;
    std::vector<Finding>& findings;
    bool isDefaultUsed = false;
};

}  // namespace

void checkScript(ScriptModel& model, std::vector<Finding>& findings) {
    Checker(model, findings).run();
}

void checkTranslations(const ScriptModel& model, const Velm::Properties& texts,
                       std::vector<Finding>& findings) {
    const auto require = [&](const ScriptText& place, const std::string& key) {
        if (texts.getPropertyValue(key.c_str()) == nullptr) {
            findings.push_back({model.file, place.line, place.column, Severity::Warning,
                                "the resource properties have no " + key});
        }
    };
    if (!model.title.value.empty()) {
        require(model.title, titleKey(model.title.value));
    }
    for (const ScriptSlot& slot : model.slots) {
        // The generator takes the class as the server writes it.
        const std::string& section =
            slot.serverSpelling.empty() ? slot.className.value : slot.serverSpelling;
        for (const ScriptText& property : slot.properties) {
            require(property, section + "." + property.value);
        }
    }
}

}  // namespace sennetctl
