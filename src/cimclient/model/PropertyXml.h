// The PROPERTY elements of DSP0201, of classes and instances alike.
#pragma once

#include <Pegasus/Common/CIMProperty.h>
#include <Pegasus/Common/CIMQualifier.h>

#include <optional>
#include <string>

#include "InstanceShape.h"
#include "ObjectXml.h"
#include "Unpacker.h"

namespace Pegasus {

/// Whether `options` want the property to be written.
bool isWanted(const CIMConstProperty& property, const ObjectXmlOptions& options);

/// Everything up to the value. Nothing in it depends on the value.
void beginProperty(std::string& xml, const CIMConstProperty& property,
                   const ObjectXmlOptions& options);
/// The same as appendValue of ObjectXml.h, of a packed value. Null: nothing.
void appendValue(std::string& xml, const PropertyDeclaration& property,
                 std::optional<Unpacker> packed);
/// What follows the value.
void endProperty(std::string& xml, const CIMConstProperty& property);

template <typename Owner>
void appendQualifiers(std::string& xml, const Owner& owner, const ObjectXmlOptions& options) {
    if (!options.includeQualifiers) {
        return;
    }
    for (Uint32 i = 0; i < owner.getQualifierCount(); ++i) {
        const CIMConstQualifier qualifier = owner.getQualifier(i);
        if (!options.localOnly || !qualifier.getPropagated()) {
            appendQualifier(xml, qualifier);
        }
    }
}

template <typename Owner>
void appendProperties(std::string& xml, const Owner& owner, const ObjectXmlOptions& options) {
    for (Uint32 i = 0; i < owner.getPropertyCount(); ++i) {
        const CIMConstProperty property = owner.getProperty(i);
        if (isWanted(property, options)) {
            beginProperty(xml, property, options);
            appendValue(xml, property.getValue());
            endProperty(xml, property);
        }
    }
}

}  // namespace Pegasus
