#include "xml/CimXmlReader.h"

#include "xml/ObjectReader.h"
#include "xml/PathReader.h"
#include "xml/ResponseReader.h"

namespace Pegasus {

CIMClass decodeGetClassResponse(ByteSource& source, const std::string& messageId) {
    ResponseReader response(source);
    ElementReader& reader = response.elements();
    ObjectReader objects(reader, response.decodeContext());
    CIMClass cimClass;
    response.read(messageId, "GetClass", [&] {
        reader.requireChildNamed("CLASS");
        cimClass = objects.readClass();
        reader.readEnd();
    });
    return cimClass;
}

Array<CIMInstance> decodeEnumerateInstancesResponse(ByteSource& source,
                                                    const std::string& messageId) {
    ResponseReader response(source);
    ElementReader& reader = response.elements();
    ObjectReader objects(reader, response.decodeContext());
    Array<CIMInstance> instances;
    response.read(messageId, "EnumerateInstances", [&] {
        while (reader.nextChild()) {
            if (!reader.is("VALUE.NAMEDINSTANCE")) {
                reader.failUnexpected("VALUE.NAMEDINSTANCE");
            }
            instances.append(objects.readNamedInstance());
        }
    });
    return instances;
}

Array<CIMName> decodeEnumerateClassNamesResponse(ByteSource& source, const std::string& messageId) {
    ResponseReader response(source);
    ElementReader& reader = response.elements();
    PathReader paths(reader, response.decodeContext());
    Array<CIMName> names;
    response.read(messageId, "EnumerateClassNames", [&] {
        while (reader.nextChild()) {
            if (!reader.is("CLASSNAME")) {
                reader.failUnexpected("CLASSNAME");
            }
            names.append(paths.readClassName());
        }
    });
    return names;
}

}  // namespace Pegasus
