#include "ObjectXml.h"

#include "InstanceWriter.h"
#include "PropertyXml.h"
#include "XmlText.h"

namespace Pegasus {

void appendClassElement(std::string& xml, const CIMConstClass& cimClass) {
    beginClassElement(xml, cimClass, ObjectXmlOptions());
    endClassElement(xml);
}

void beginClassElement(std::string& xml, const CIMConstClass& cimClass,
                       const ObjectXmlOptions& options) {
    xml += "<CLASS";
    appendAttribute(xml, "NAME", cimClass.getClassName().getString());
    if (!cimClass.getSuperClassName().isNull()) {
        appendAttribute(xml, "SUPERCLASS", cimClass.getSuperClassName().getString());
    }
    xml += '>';
    appendQualifiers(xml, cimClass, options);
    appendProperties(xml, cimClass, options);
}

void endClassElement(std::string& xml) {
    xml += "</CLASS>";
}

void appendInstance(std::string& xml, const CIMConstInstance& instance,
                    const ObjectXmlOptions& options) {
    InstanceWriter(options).append(xml, instance);
}

void appendObject(std::string& xml, const CIMObject& object) {
    if (object.isUninitialized()) {
        return;
    }
    if (object.isClass()) {
        appendClassElement(xml, CIMConstClass(object));
    } else {
        appendInstance(xml, CIMConstInstance(object));
    }
}

}  // namespace Pegasus
