#include "script/NewScript.h"

#include <algorithm>
#include <string_view>

#include "cim/CimText.h"
#include "script/ColumnCheck.h"

namespace sennetctl {

using namespace Pegasus;

namespace {

constexpr std::size_t kLineLimit = 1024;
constexpr std::size_t kLongestTitle = 13;  // what no product shortens
constexpr const char* kGuessedSize = "64";

bool isCapital(char c) {
    return c >= 'A' && c <= 'Z';
}

bool endsWith(const std::string& text, std::string_view end) {
    return text.size() >= end.size() &&
           text.compare(text.size() - end.size(), end.size(), end) == 0;
}

std::string withUnderscores(std::string text) {
    std::replace(text.begin(), text.end(), ' ', '_');
    return text;
}

class Composer {
  public:
    NewScript compose(const std::string& stem, const std::string& title,
                      const std::string& nameSpace, const std::vector<AnsweredClass>& classes) {
        result.script = "[DEFAULT]\ntitle=" + title + "\n\n[CIM]\n";
        result.properties = "# " + stem + ".script.inv\ntitle." + withUnderscores(title) + "=" +
                            readableName(stem).substr(0, kLongestTitle) + "\n";
        for (std::size_t i = 0; i < classes.size(); ++i) {
            addClass(std::to_string(i), nameSpace, classes[i]);
        }
        return result;
    }

  private:
    void addClass(const std::string& slot, const std::string& nameSpace,
                  const AnsweredClass& answered) {
        const std::string className = textOf(answered.definition.getClassName());
        std::string list = "A[" + slot + "]=";
        bool first = true;
        CIMClass definition = answered.definition;
        for (Uint32 i = 0; i < definition.getPropertyCount(); ++i) {
            const std::string name = textOf(definition.getProperty(i).getName());
            const std::string reason = reasonToLeaveOut(answered, name);
            const bool tooLong = list.size() + 1 + name.size() > kLineLimit;
            if (!reason.empty() || tooLong) {
                leaveOut(className, name, tooLong ? "the line would be too long" : reason);
                continue;
            }
            list.append(first ? "" : ",").append(name);
            first = false;
            addNames(answered, className, name);
        }
        result.script +=
            "G[" + slot + "]=" + className + "\nN[" + slot + "]=" + nameSpace + "\n" + list + "\n";
    }

    void leaveOut(const std::string& className, const std::string& name,
                  const std::string& reason) {
        std::string text = className;
        result.leftOut.push_back(text.append(".").append(name).append(": ").append(reason));
    }

    static std::string reasonToLeaveOut(const AnsweredClass& answered, const std::string& name) {
        const std::optional<Column> column = columnOf(answered, name);
        const CIMType type = column->declared->getType();
        if (type == CIMTYPE_REFERENCE || type == CIMTYPE_OBJECT || type == CIMTYPE_INSTANCE) {
            return "no file can show it";
        }
        if (endsWith(name, "CreationClassName")) {
            return "it is the name of a class";
        }
        const bool empty = !answered.instances.empty() && isEmpty(*column, answered);
        return empty ? "it has no value on this machine" : "";
    }

    void addNames(const AnsweredClass& answered, const std::string& className,
                  const std::string& name) {
        const std::string key = className + "." + name;
        result.properties += key + "=" + readableName(name) + "\n";
        if (lacksSize(*columnOf(answered, name), answered, Velm::Properties())) {
            result.properties += key + ".Size=" + kGuessedSize + "\n";
        }
    }

    NewScript result;
};

}  // namespace

NewScript composeScript(const std::string& stem, const std::string& title,
                        const std::string& nameSpace, const std::vector<AnsweredClass>& classes) {
    return Composer().compose(stem, title, nameSpace, classes);
}

std::string readableName(const std::string& name) {
    std::string text;
    for (std::size_t i = 0; i < name.size(); ++i) {
        const bool afterSmall = i > 0 && !isCapital(name[i - 1]);
        const bool beforeSmall =
            i > 0 && i + 1 < name.size() && name[i + 1] >= 'a' && name[i + 1] <= 'z';
        if (isCapital(name[i]) && (afterSmall || beforeSmall)) {
            text += ' ';
        }
        text += name[i] == '_' ? ' ' : name[i];
    }
    if (!text.empty() && text[0] >= 'a' && text[0] <= 'z') {
        text[0] = static_cast<char>(text[0] - 'a' + 'A');
    }
    return text;
}

}  // namespace sennetctl
