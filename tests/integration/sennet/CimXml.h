#pragma once

// Short CIM-XML for scripted answers.

#include <initializer_list>
#include <string>

/// A class CIM_... with the string property Name, MaxLen 64.
inline std::string namedClass(const std::string& name) {
    return "<CLASS NAME=\"" + name +
           "\"><PROPERTY NAME=\"Name\" TYPE=\"string\"><QUALIFIER NAME=\"MaxLen\" TYPE=\"uint32\">"
           "<VALUE>64</VALUE></QUALIFIER></PROPERTY></CLASS>";
}

/// Its instances, one per value of Name.
inline std::string namedInstances(const std::string& className,
                                  std::initializer_list<const char*> names) {
    std::string xml;
    for (const char* name : names) {
        xml += "<VALUE.NAMEDINSTANCE><INSTANCENAME CLASSNAME=\"" + className +
               "\"><KEYBINDING NAME=\"Name\"><KEYVALUE VALUETYPE=\"string\">" + name +
               "</KEYVALUE></KEYBINDING></INSTANCENAME><INSTANCE CLASSNAME=\"" + className +
               "\"><PROPERTY NAME=\"Name\" TYPE=\"string\"><VALUE>" + name +
               "</VALUE></PROPERTY></INSTANCE></VALUE.NAMEDINSTANCE>";
    }
    return xml;
}

/// The /SMS file of a script titled so with one class as above and one instance.
inline std::string namedMif(const std::string& title, const std::string& value) {
    return "Start Component\r\n"
           "   Name = \"Machine\"\r\n"
           "\r\n"
           "   Start Group\r\n"
           "      Name = \"" +
           title +
           "\"\r\n"
           "      Class = \"Corvane-Velt|KWX MIF " +
           title +
           "|001\"\r\n"
           "      Key = 1\r\n"
           "      Start Attribute\r\n"
           "         Name = \"Index\"\r\n"
           "         Id = 1\r\n"
           "         Type = Integer\r\n"
           "         Value = 1\r\n"
           "      End Attribute\r\n"
           "\r\n"
           "      Start Attribute\r\n"
           "         Name = \"Name\"\r\n"
           "         Id = 2\r\n"
           "         Type = String(64)\r\n"
           "         Value = \"" +
           value +
           "\"\r\n"
           "      End Attribute\r\n"
           "   End Group\r\n"
           "\r\n"
           "   Start Table\r\n"
           "      Name = \"" +
           title +
           "\"\r\n"
           "      Class = \"Corvane-Velt|KWX MIF " +
           title +
           "|001\"\r\n"
           "      Id = 2\r\n"
           "      { 1, \"" +
           value +
           "\"}\r\n"
           "\r\n"
           "   End Table\r\n"
           "End Component\r\n";
}
