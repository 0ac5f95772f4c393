#include "SennetConverter/framework/CimConverter.h"

#include <cstring>

#include "SennetConverter/framework/NameRules.h"
#include "SennetConverter/framework/PropertyLookup.h"
#include "SennetConverter/framework/SennetUtilities.h"

namespace Pegasus {

namespace {

constexpr int kOpenForWriting = 1;

}  // namespace

CimConverter::CimConverter(const String& fileName, const Velm::Properties& theProperties,
                           unsigned int theMaxNameLength)
    : outputFile(fileName.getCString()),
      properties(theProperties),
      maxNameLength(theMaxNameLength) {}

CimConverter::~CimConverter() {
    closeFile();
}

String CimConverter::hashString(String text) {
    return text;
}

String CimConverter::substituteValues(String text) {
    return text;
}

void CimConverter::openFileIfNeeded() {
    if (fileOpen == 0) {
        outputFile.open(kOpenForWriting);
        fileOpen = 1;
    }
}

void CimConverter::Output(const char* text) {
    outputFile.writeLine(text, static_cast<int>(std::strlen(text)));
    somethingWritten = 1;
}

void CimConverter::closeFile() {
    if (fileOpen == 1) {
        outputFile.close();
        fileOpen = 0;
    }
    if (somethingWritten == 0) {
        outputFile.remove();
    }
}

String CimConverter::getTranslatedPropertyName(String section, String propertyName) {
    return translatedPropertyName(properties, section, propertyName);
}

String CimConverter::formatTitle(String title) {
    return substituteValues(hashString(SennetUtilities::trim(translatedTitle(properties, title))));
}

void CimConverter::forEachColumn(CimScriptParser& parser, Array<CIMClass>& classes,
                                 const std::function<String(const String&)>& format,
                                 const std::function<void(const Column&)>& visit) {
    Array<String> usedNames;
    int count = 0;
    for (Uint32 k = 0; k < classes.size(); ++k) {
        const String className = classes[k].getClassName().getString();
        const Array<CIMName> names = scriptProperties(parser, classes[k]);
        for (Uint32 i = 0; i < names.size(); ++i) {
            ++count;
            const String numberText = SennetUtilities::toDecimal(count + 1);
            const String name = format(getTranslatedPropertyName(className, names[i].getString()));
            const bool last = k + 1 == classes.size() && i + 1 == names.size();
            visit({k, names[i], SennetUtilities::makeUnique(name, numberText, usedNames),
                   numberText, last});
        }
    }
}

}  // namespace Pegasus
