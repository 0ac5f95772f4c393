#include "SennetConverter/framework/NameRules.h"

#include "SennetConverter/framework/SennetUtilities.h"

namespace Pegasus {

String translatedPropertyName(const Velm::Properties& texts, const String& section,
                              const String& propertyName) {
    const String name = SennetUtilities::replaceAll(propertyName, ' ', '_');
    const String key = section.size() > 0 ? section + "." + name : name;
    const char* translation = texts.getPropertyValue(key.getCString());
    return SennetUtilities::trim(translation != nullptr ? String(translation) : propertyName);
}

String translatedTitle(const Velm::Properties& texts, const String& title) {
    const String name = SennetUtilities::replaceAll(title, ' ', '_');
    const char* translation = texts.getPropertyValue((String("title.") + name).getCString());
    return translation != nullptr ? String(translation) : name;
}

}  // namespace Pegasus
