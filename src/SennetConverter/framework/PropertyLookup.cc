#include "SennetConverter/framework/PropertyLookup.h"

#include "CimScriptParser/CimScriptParser.h"

namespace Pegasus {

ResolvedProperty resolveProperty(CIMClass& cimClass, CIMInstance* instance, const CIMName& name) {
    ResolvedProperty resolved;
    const Uint32 inClass = cimClass.findProperty(name);
    const Uint32 inInstance = instance != nullptr ? instance->findProperty(name) : PEG_NOT_FOUND;
    if (inClass == PEG_NOT_FOUND && inInstance == PEG_NOT_FOUND) {
        return resolved;
    }
    const CIMProperty holder = inInstance != PEG_NOT_FOUND ? instance->getProperty(inInstance)
                                                           : cimClass.getProperty(inClass);
    resolved.type = holder.getType();
    resolved.value = holder.getValue();
    resolved.property = inClass != PEG_NOT_FOUND ? cimClass.getProperty(inClass) : holder;
    return resolved;
}

Array<CIMName> scriptProperties(CimScriptParser& parser, CIMClass& cimClass) {
    const CIMPropertyList list =
        parser.getPropertyList(parser.getClassIndex(cimClass.getClassName().getString()));
    return list.isNull() ? Array<CIMName>() : list.getPropertyNameArray();
}

}  // namespace Pegasus
