#include "cim/ValueText.h"

#include <Pegasus/Common/CIMDateTime.h>
#include <Pegasus/Common/CIMObjectPath.h>

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
template <typename Number>
Json plain(Number number) {
    return number;
}

template <typename T>
Json read(const CIMValue& value) {
    if (!value.isArray()) {
        T element{};
        value.get(element);
        return plain(element);
    }
    Array<T> elements;
    value.get(elements);
    Json list = Json::array();
    for (Uint32 i = 0; i < elements.size(); ++i) {
        list.push_back(plain(static_cast<const Array<T>&>(elements)[i]));
    }
    return list;
}

Json withoutNames(const CIMValue& value) {
    switch (value.getType()) {
        case CIMTYPE_BOOLEAN:
            return read<Boolean>(value);
        case CIMTYPE_UINT8:
            return read<Uint8>(value);
        case CIMTYPE_SINT8:
            return read<Sint8>(value);
        case CIMTYPE_UINT16:
            return read<Uint16>(value);
        case CIMTYPE_SINT16:
            return read<Sint16>(value);
        case CIMTYPE_UINT32:
            return read<Uint32>(value);
        case CIMTYPE_SINT32:
            return read<Sint32>(value);
        case CIMTYPE_UINT64:
            return read<Uint64>(value);
        case CIMTYPE_SINT64:
            return read<Sint64>(value);
        case CIMTYPE_REAL32:
            return read<Real32>(value);
        case CIMTYPE_REAL64:
            return read<Real64>(value);
        case CIMTYPE_CHAR16:
            return read<Char16>(value);
        case CIMTYPE_STRING:
            return read<String>(value);
        case CIMTYPE_DATETIME:
            return read<CIMDateTime>(value);
        case CIMTYPE_REFERENCE:
            return read<CIMObjectPath>(value);
        default:
            return textOf(value.toString());
    }
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
    const CIMType type = value.getType();
    if (declared == nullptr || type < CIMTYPE_UINT8 || type > CIMTYPE_SINT64) {
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
