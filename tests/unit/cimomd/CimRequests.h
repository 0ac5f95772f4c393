#pragma once

// Requests as a client writes them.

#include <sstream>
#include <string>
#include <vector>

#include "xml/CimRequest.h"
#include "xml/MemorySource.h"

namespace cimomd {

inline std::string flag(const std::string& name, bool value) {
    return "<IPARAMVALUE NAME=\"" + name + "\"><VALUE>" + (value ? "TRUE" : "FALSE") +
           "</VALUE></IPARAMVALUE>";
}

inline std::string propertyList(const std::vector<std::string>& names) {
    std::string xml = "<IPARAMVALUE NAME=\"PropertyList\"><VALUE.ARRAY>";
    for (const std::string& name : names)
        xml += "<VALUE>" + name + "</VALUE>";
    return xml + "</VALUE.ARRAY></IPARAMVALUE>";
}

/// A whole request with the message id 7; an empty class name leaves the parameter out.
inline std::string requestBody(const std::string& method, const std::string& nameSpace,
                               const std::string& className, const std::string& parameters = "") {
    std::string path;
    std::istringstream parts(nameSpace);
    for (std::string part; std::getline(parts, part, '/');)
        path += "<NAMESPACE NAME=\"" + part + "\"/>";
    std::string xml =
        "<?xml version=\"1.0\" encoding=\"utf-8\"?>\n<CIM CIMVERSION=\"2.0\" DTDVERSION=\"2.0\">"
        "<MESSAGE ID=\"7\" PROTOCOLVERSION=\"1.0\"><SIMPLEREQ><IMETHODCALL NAME=\"" +
        method + "\"><LOCALNAMESPACEPATH>" + path + "</LOCALNAMESPACEPATH>";
    if (!className.empty())
        xml +=
            "<IPARAMVALUE NAME=\"ClassName\"><CLASSNAME NAME=\"" + className + "\"/></IPARAMVALUE>";
    return xml + parameters + "</IMETHODCALL></SIMPLEREQ></MESSAGE></CIM>";
}

inline Pegasus::CimRequest decoded(const std::string& body) {
    Pegasus::MemorySource source(body);
    return Pegasus::decodeRequest(source);
}

}  // namespace cimomd
