#include "cim/ValueText.h"

#include <Pegasus/Common/CIMDateTime.h>
#include <Pegasus/Common/CIMInstance.h>
#include <Pegasus/Common/CIMObject.h>
#include <Pegasus/Common/CIMObjectPath.h>

#include <algorithm>
#include <utility>
#include <variant>

#include "SennetConverter/framework/CimConverter.h"
#include "cim/CimText.h"
#include "utf8/Utf8.h"

namespace sennetctl {

namespace {

using namespace Pegasus;

Json plain(Boolean flag) {
    return static_cast<bool>(flag);
}
Json plain(const String& text) {
    return textOf(text);
}
Json plain(Char16 character) {
    return textOf(String(&character, 1));
}
Json plain(const CIMDateTime& time) {
    return textOf(time.toString());
}
Json plain(const CIMObjectPath& path) {
    return textOf(path.toString());
}
// Only for completeness: they are shown as a whole.
Json plain(const CIMObject& object) {
    return textOf(CIMValue(object).toString());
}
Json plain(const CIMInstance& instance) {
    return textOf(CIMValue(instance).toString());
}
template <typename Number>
Json plain(Number number) {
    return number;
}

struct Plain {
    Json operator()(std::monostate) const { return nullptr; }
    template <typename T>
    Json operator()(const T& element) const {
        return plain(element);
    }
    template <typename T>
    Json operator()(const Array<T>& elements) const {
        Json list = Json::array();
        for (const T& element : elements) {
            list.push_back(plain(element));
        }
        return list;
    }
};

Json withoutNames(const CIMValue& value) {
    // Embedded objects have one text, arrays of them included.
    return value.getType() > CIMTYPE_REFERENCE ? Json(textOf(value.toString()))
                                               : value.visit(Plain());
}

std::string elementText(const Json& element) {
    if (element.is_string()) {
        return element.get<std::string>();
    }
    return element.is_null() ? std::string() : element.dump();
}

/// No more than the front of a name, of at least `longest` octets if it has so many.
std::string nameOf(const Json& number, const ValueNames& known, std::size_t longest) {
    // A negative number has no name here, as in the MIF files.
    const bool isNegative = !number.is_number_unsigned() && number.get<Sint64>() < 0;
    if (isNegative) {
        return number.dump();
    }
    const auto most = static_cast<Uint32>(std::min<std::size_t>(longest, PEG_NOT_FOUND));
    return textOf(known.nameOf(number.get<Uint64>()).subString(0, most));
}

/// The text itself, or no more than `longest` octets of it, in whole characters, and "...".
std::string cut(std::string text, std::size_t longest) {
    if (text.size() <= longest) {
        return text;
    }
    std::size_t end = longest;
    while (end > 0 && utf8::isContinuation(text[end])) {
        --end;
    }
    text.resize(end);
    return text + "...";
}

}  // namespace

std::string ValueText::shown(const CIMValue& value, const CIMProperty* declared,
                             std::size_t longest) {
    if (value.isNull()) {
        return {};
    }
    const ValueNames* known = namesFor(value, declared);
    const auto textFor = [&](const Json& element) {
        // One more than is shown, so that it is seen that there is more.
        return known == nullptr ? elementText(element) : nameOf(element, *known, longest + 1);
    };
    const Json content = withoutNames(value);
    std::string text;
    if (!content.is_array()) {
        text = textFor(content);
    } else {
        for (std::size_t i = 0; i < content.size() && text.size() <= longest; ++i) {
            text += (text.empty() ? "" : ", ") + textFor(content[i]);
        }
    }
    text = cut(std::move(text), longest);
    room.take(sizeof(std::string) + text.size());
    return text;
}

Json ValueText::json(const CIMValue& value, const CIMProperty* declared) {
    Json number = value.isNull() ? Json(nullptr) : withoutNames(value);
    takeRoomFor(number);
    const ValueNames* known = namesFor(value, declared);
    if (known == nullptr) {
        return number;
    }
    Json both = Json::object();
    Json name = names(number, *known);
    both["value"] = std::move(number);
    both["text"] = std::move(name);
    return both;
}

/// The names of the numbers of this value; null when it has none.
const ValueNames* ValueText::namesFor(const CIMValue& value, const CIMProperty* declared) {
    if (value.isNull() || declared == nullptr || !CimConverter::isInteger(value.getType())) {
        return nullptr;
    }
    const Uint32 position = declared->findQualifier(CIMName("Values"));
    return position == PEG_NOT_FOUND ? nullptr : &cache.of(*declared, position);
}

/// The name of a number, or those of an array of them.
Json ValueText::names(const Json& numbers, const ValueNames& known) {
    if (!numbers.is_array()) {
        Json name = nameOf(numbers, known, PEG_NOT_FOUND);
        takeRoomFor(name);
        return name;
    }
    Json list = Json::array();
    for (const Json& number : numbers) {
        list.push_back(names(number, known));
    }
    return list;
}

void ValueText::takeRoomFor(const Json& content) {
    constexpr std::size_t kOctetsOfText = sizeof(std::string);
    room.take(sizeof(Json));
    if (content.is_string()) {
        room.take(kOctetsOfText + content.get_ref<const std::string&>().size());
    } else if (content.is_array()) {
        for (const Json& element : content) {
            takeRoomFor(element);
        }
    }
}

}  // namespace sennetctl
