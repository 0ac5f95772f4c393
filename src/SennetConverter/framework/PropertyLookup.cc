#include "SennetConverter/framework/PropertyLookup.h"

#include "CimScriptParser/CimScriptParser.h"

namespace Pegasus {

PropertyLookup::PropertyLookup(CIMClass& cimClass, const CIMName& theName) : name(theName) {
    const Uint32 position = cimClass.findProperty(name);
    declared = position != PEG_NOT_FOUND;
    if (declared) {
        inClass = cimClass.getProperty(position);
    }
}

ResolvedProperty PropertyLookup::in(const CIMInstance* instance) const {
    const Uint32 position = instance != nullptr ? instance->findProperty(name) : PEG_NOT_FOUND;
    if (position != PEG_NOT_FOUND) {
        const CIMConstProperty holder = instance->getProperty(position);
        return {declared ? inClass : holder.clone(), holder.getType(), holder.getValue()};
    }
    if (declared) {
        return {inClass, inClass.getType(), inClass.getValue()};
    }
    return {};
}

Array<CIMName> scriptProperties(CimScriptParser& parser, CIMClass& cimClass) {
    const CIMPropertyList list =
        parser.getPropertyList(parser.getClassIndex(cimClass.getClassName().getString()));
    return list.isNull() ? Array<CIMName>() : list.getPropertyNameArray();
}

}  // namespace Pegasus
