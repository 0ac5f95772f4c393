#include "script/NewScript.h"

#include <algorithm>
#include <string_view>

#include "SennetConverter/framework/NameRules.h"
#include "cim/CimText.h"
#include "report/Text.h"
#include "report/WholeFile.h"
#include "script/ColumnCheck.h"
#include "script/ColumnNames.h"
#include "script/ValueCheck.h"

namespace sennetctl {

using namespace Pegasus;

namespace {

constexpr std::size_t kLineLimit = 1024;
constexpr std::size_t kLongestText = 255;

bool endsWith(const std::string& text, std::string_view end) {
    return text.size() >= end.size() &&
           text.compare(text.size() - end.size(), end.size(), end) == 0;
}

/// A key as a file of properties has it, in which some characters mean something.
std::string escapedKey(const std::string& key) {
    std::string text;
    for (const char c : key) {
        if (c == '\\' || c == ':' || c == '=') {
            text += '\\';
        }
        text += c;
    }
    return text;
}

std::string escapedValue(const std::string& value) {
    std::string text;
    for (const char c : value) {
        text.append(c == '\\' ? 2 : 1, c);
    }
    return text;
}

/// A guess with room for longer values.
std::size_t sizeFor(std::size_t longest) {
    for (const std::size_t size : {std::size_t(64), std::size_t(128)}) {
        if (longest <= size) {
            return size;
        }
    }
    return kLongestText;
}

class Composer {
  public:
    explicit Composer(const NewScriptPlan& thePlan) : plan(thePlan) {}

    NewScript compose() {
        result.script = "[DEFAULT]\ntitle=" + plan.title + "\n\n[CIM]\n";
        // What it is appended to may lack its last line end.
        result.properties = "\n# " + printable(plan.fileName) + "\n";
        std::string key = "title." + plan.title;
        std::replace(key.begin(), key.end(), ' ', '_');
        addText(key, plan.shownTitle);
        // Behind a class without instances the others would get its columns.
        for (const bool empty : {false, true}) {
            for (const AnsweredClass& answered : plan.classes) {
                if (answered.instances.empty() == empty) {
                    addClass(answered);
                }
            }
        }
        for (const Entry& entry : entries) {
            addNames(entry);
        }
        return result;
    }

  private:
    /// A property that is listed.
    struct Entry {
        const AnsweredClass* answered;
        std::string key;
        std::string property;
    };

    void addClass(const AnsweredClass& answered) {
        const std::string className = textOf(answered.definition.getClassName());
        const std::string number = "[" + std::to_string(slot++) + "]=";
        std::string list = "A" + number;
        const std::size_t start = list.size();
        for (Uint32 i = 0; i < answered.definition.getPropertyCount(); ++i) {
            listProperty(answered, textOf(CIMClass(answered.definition).getProperty(i).getName()),
                         list, list.size() == start);
        }
        if (list.size() == start) {
            throw CannotRun(className + " has no property that a script can list");
        }
        result.script.append("G").append(number).append(className).append("\nN");
        result.script.append(number).append(plan.nameSpace).append("\n").append(list).append("\n");
    }

    /// Appends the property to the list, or tells why not.
    void listProperty(const AnsweredClass& answered, const std::string& name, std::string& list,
                      bool isFirst) {
        std::string key = textOf(answered.definition.getClassName());
        key.append(".").append(name);
        const bool tooLong = list.size() + 1 + name.size() > kLineLimit;
        const std::string reason =
            tooLong ? "the line would be too long" : reasonToLeaveOut(answered, key, name);
        if (!reason.empty()) {
            result.leftOut.push_back(key.append(": ").append(reason));
            return;
        }
        list.append(isFirst ? "" : ",").append(name);
        entries.push_back({&answered, key, name});
    }

    std::string reasonToLeaveOut(const AnsweredClass& answered, const std::string& key,
                                 const std::string& name) {
        const std::optional<Column> column = columnOf(answered, name);
        const CIMType type = column->declared->getType();
        if (type == CIMTYPE_REFERENCE || type == CIMTYPE_OBJECT || type == CIMTYPE_INSTANCE) {
            return "no file can show it";
        }
        if (endsWith(name, "CreationClassName")) {
            return "it is the name of a class";
        }
        if (!answered.instances.empty() && isEmpty(*column, answered)) {
            return "it has no value on this machine";
        }
        if (countWideValues(*column, answered) > 0) {
            return "it has numbers beyond 32 bits with sign";
        }
        if (hasText(key) && !names.take(textGivenTo(answered, name))) {
            return "its name " + textGivenTo(answered, name) + " is that of another column";
        }
        return {};
    }

    bool hasText(const std::string& key) const {
        return plan.texts.getPropertyValue(key.c_str()) != nullptr;
    }

    std::string textGivenTo(const AnsweredClass& answered, const std::string& name) const {
        return textOf(translatedPropertyName(
            plan.texts, answered.definition.getClassName().getString(), String(name.c_str())));
    }

    void addNames(const Entry& entry) {
        const Column column = *columnOf(*entry.answered, entry.property);
        const bool isNamed = hasText(entry.key);
        addText(entry.key, isNamed ? "" : names.choose(readableName(entry.property)));
        const std::size_t longest =
            column.declared->isArray()
                ? 0
                : std::min(longestText(column, *entry.answered), kLongestText);
        const std::size_t declared = declaredSize(column, *entry.answered, Velm::Properties());
        if (lacksSize(column, *entry.answered, Velm::Properties()) ||
            (declared > 0 && longest > declared)) {
            addText(entry.key + ".Size", std::to_string(sizeFor(longest)));
        }
    }

    void addText(const std::string& key, const std::string& text) {
        if (hasText(key)) {
            result.present.push_back(key);
        } else {
            result.properties += escapedKey(key) + "=" + escapedValue(text) + "\n";
        }
    }

    const NewScriptPlan& plan;
    unsigned slot = 0;
    ColumnNames names;
    std::vector<Entry> entries;
    NewScript result;
};

}  // namespace

NewScript composeScript(const NewScriptPlan& plan) {
    return Composer(plan).compose();
}

}  // namespace sennetctl
