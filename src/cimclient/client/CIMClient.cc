#include <Pegasus/Client/CIMClient.h>

#include "client/CIMClientRep.h"

namespace Pegasus {

CIMClient::CIMClient() : rep(std::make_unique<CIMClientRep>(ClientSettings::standard())) {}

CIMClient::~CIMClient() = default;

void CIMClient::setTimeout(Uint32 timeoutMilliseconds) {
    rep->setTimeout(timeoutMilliseconds);
}

void CIMClient::connectLocal() {
    rep->connectLocal();
}

void CIMClient::disconnect() {
    rep->disconnect();
}

CIMClass CIMClient::getClass(const CIMNamespaceName& nameSpace, const CIMName& className,
                             Boolean localOnly, Boolean includeQualifiers,
                             Boolean includeClassOrigin, const CIMPropertyList& propertyList) {
    return rep->getClass(nameSpace, className, localOnly, includeQualifiers, includeClassOrigin,
                         propertyList);
}

Array<CIMInstance> CIMClient::enumerateInstances(const CIMNamespaceName& nameSpace,
                                                 const CIMName& className, Boolean deepInheritance,
                                                 Boolean localOnly, Boolean includeQualifiers,
                                                 Boolean includeClassOrigin,
                                                 const CIMPropertyList& propertyList) {
    return rep->enumerateInstances(nameSpace, className, deepInheritance, localOnly,
                                   includeQualifiers, includeClassOrigin, propertyList);
}

Array<CIMName> CIMClient::enumerateClassNames(const CIMNamespaceName& nameSpace,
                                              const CIMName& className, Boolean deepInheritance) {
    return rep->enumerateClassNames(nameSpace, className, deepInheritance);
}

}  // namespace Pegasus
