#include "ConverterFixture.h"

namespace generatortest {

using namespace Pegasus;

Array<String> strings(std::initializer_list<const char*> texts) {
    Array<String> result;
    for (const char* text : texts) {
        result.append(String(text));
    }
    return result;
}

CIMValue text(const char* utf8) {
    return CIMValue(String(utf8));
}

CIMValue null(CIMType type) {
    return CIMValue(type, false);
}

CIMValue nullArray(CIMType type) {
    return CIMValue(type, true);
}

CIMProperty property(const char* name, const CIMValue& value,
                     std::initializer_list<CIMQualifier> qualifiers) {
    CIMProperty result(CIMName(name), value);
    for (const CIMQualifier& qualifier : qualifiers) {
        result.addQualifier(qualifier);
    }
    return result;
}

CIMQualifier textsQualifier(const char* name, std::initializer_list<const char*> texts) {
    return CIMQualifier(CIMName(name), CIMValue(strings(texts)));
}

CIMQualifier maxLen(Uint32 length) {
    return CIMQualifier(CIMName("MaxLen"), CIMValue(length));
}

CIMClass cimClass(const char* name, std::initializer_list<CIMProperty> properties) {
    CIMClass result{CIMName(name)};
    for (const CIMProperty& property : properties) {
        result.addProperty(property);
    }
    return result;
}

CIMInstance cimInstance(const char* name, std::initializer_list<CIMProperty> properties) {
    CIMInstance result{CIMName(name)};
    for (const CIMProperty& property : properties) {
        result.addProperty(property);
    }
    return result;
}

Inventory::Inventory(const std::vector<Answer>& answers) {
    for (const Answer& answer : answers) {
        classes.append(answer.cimClass);
        Array<CIMInstance> instances;
        for (const CIMInstance& instance : answer.instances) {
            instances.append(instance);
        }
        lists.addInstanceList(instances);
    }
}

CimScriptParser& ConverterFixture::script(const std::string& text, const std::string& stem) {
    const std::string file = path(stem + ".script.inv");
    support::writeFile(file, text);
    parsers.push_back(std::make_unique<CimScriptParser>(String(file.c_str())));
    parsers.back()->parse();
    return *parsers.back();
}

std::string ConverterFixture::path(const std::string& name) const {
    return (std::filesystem::path(directory.path()) / name).string();
}

std::string ConverterFixture::output() const {
    return support::readFile(path("out.mif"));
}

}  // namespace generatortest
