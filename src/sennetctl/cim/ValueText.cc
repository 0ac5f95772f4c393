#include "cim/ValueText.h"

#include <Pegasus/Common/CIMDateTime.h>
#include <Pegasus/Common/CIMInstance.h>
#include <Pegasus/Common/CIMObject.h>
#include <Pegasus/Common/CIMObjectPath.h>

#include <variant>

#include "SennetConverter/framework/CimConverter.h"
#include "cim/CimText.h"

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

}  // namespace

std::string ValueText::shown(const CIMValue& value, const CIMProperty* declared) {
    if (value.isNull()) {
        return {};
    }
    Json content = names(value, declared);
    if (content.is_null()) {
        content = withoutNames(value);
    }
    if (!content.is_array()) {
        return elementText(content);
    }
    std::string text;
    for (const Json& element : content) {
        text += (text.empty() ? "" : ", ") + elementText(element);
    }
    return text;
}

Json ValueText::json(const CIMValue& value, const CIMProperty* declared) {
    if (value.isNull()) {
        return nullptr;
    }
    Json number = withoutNames(value);
    Json name = names(value, declared);
    if (name.is_null()) {
        return number;
    }
    Json both = Json::object();
    both["value"] = std::move(number);
    both["text"] = std::move(name);
    return both;
}

/// The names of an integer or of those of an array; null when the property has none.
Json ValueText::names(const CIMValue& value, const CIMProperty* declared) {
    if (declared == nullptr || !CimConverter::isInteger(value.getType())) {
        return nullptr;
    }
    const Uint32 position = declared->findQualifier(CIMName("Values"));
    if (position == PEG_NOT_FOUND) {
        return nullptr;
    }
    const ValueNames& known = cache.of(*declared, position);
    const auto name = [&known](const Json& number) -> Json {
        // A negative number has no name here, as in the MIF files.
        return number.is_number_unsigned() || number.get<Sint64>() >= 0
                   ? Json(textOf(known.nameOf(number.get<Uint64>())))
                   : Json(number.dump());
    };
    const Json numbers = withoutNames(value);
    if (!numbers.is_array()) {
        return name(numbers);
    }
    Json list = Json::array();
    for (const Json& number : numbers) {
        list.push_back(name(number));
    }
    return list;
}

}  // namespace sennetctl
