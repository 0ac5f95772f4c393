#include "InstanceWriter.h"

#include "InstanceBody.h"
#include "PropertyXml.h"
#include "XmlText.h"

namespace Pegasus {

void InstanceWriter::append(std::string& xml, const CIMConstInstance& instance) {
    xml += "<INSTANCE";
    appendAttribute(xml, "CLASSNAME", instance.getClassName().getString());
    xml += '>';
    appendQualifiers(xml, instance, options);
    if (const PackedProperties* const properties = instance.access().properties.packed()) {
        appendPacked(xml, instance, *properties);
    } else {
        appendProperties(xml, instance, options);
    }
    xml += "</INSTANCE>";
}

void InstanceWriter::appendPacked(std::string& xml, const CIMConstInstance& instance,
                                  const PackedProperties& properties) {
    if (properties.getShape() != shape) {
        makeFrames(instance);
        shape = properties.getShape();
    }
    for (const Frame& frame : frames) {
        xml += frame.begin;
        appendValue(xml, properties.declaration(frame.index), properties.unpack(frame.index));
        xml += frame.end;
    }
}

void InstanceWriter::makeFrames(const CIMConstInstance& instance) {
    frames.clear();
    for (Uint32 i = 0; i < instance.getPropertyCount(); ++i) {
        const CIMConstProperty property = instance.getProperty(i);
        if (isWanted(property, options)) {
            Frame frame{i, {}, {}};
            beginProperty(frame.begin, property, options);
            endProperty(frame.end, property);
            frames.push_back(std::move(frame));
        }
    }
}

}  // namespace Pegasus
