// Texts of answers for the tests of the decoder.

#pragma once

#include <string>

namespace Pegasus {

/// An answer with message ID 7 to `method`, `content` being what is inside IMETHODRESPONSE.
inline std::string responseText(const std::string& method, const std::string& content) {
    return "<?xml version=\"1.0\" encoding=\"utf-8\" ?>\n"
           "<CIM CIMVERSION=\"2.0\" DTDVERSION=\"2.0\">\n"
           "<MESSAGE ID=\"7\" PROTOCOLVERSION=\"1.0\">\n<SIMPLERSP>\n"
           "<IMETHODRESPONSE NAME=\"" +
           method + "\">\n" + content + "</IMETHODRESPONSE>\n</SIMPLERSP>\n</MESSAGE>\n</CIM>\n";
}

inline std::string classText(const std::string& xml) {
    return responseText("GetClass", "<IRETURNVALUE>\n" + xml + "</IRETURNVALUE>\n");
}

inline std::string instancesText(const std::string& xml) {
    return responseText("EnumerateInstances", "<IRETURNVALUE>\n" + xml + "</IRETURNVALUE>\n");
}

/// VALUE.NAMEDINSTANCE of class T_Thing with key Id and `members` inside INSTANCE.
inline std::string instanceXml(const std::string& members, const std::string& id = "1") {
    return "<VALUE.NAMEDINSTANCE>\n<INSTANCENAME CLASSNAME=\"T_Thing\">"
           "<KEYBINDING NAME=\"Id\"><KEYVALUE VALUETYPE=\"string\">" +
           id +
           "</KEYVALUE></KEYBINDING></INSTANCENAME>\n"
           "<INSTANCE CLASSNAME=\"T_Thing\" >\n" +
           members + "</INSTANCE>\n</VALUE.NAMEDINSTANCE>\n";
}

}  // namespace Pegasus
