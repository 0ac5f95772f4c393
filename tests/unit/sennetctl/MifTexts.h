#pragma once

// Small MIF files.

#include <string>

namespace sennetctl {

/// Two lines of a component, which end it is then to get.
inline const std::string kMifStart = "Start Component\n Name = \"Machine\"\n";

/// Lines 3 to 12: the group that the standard requires.
inline const std::string kComponentId =
    " Start Group\n  Name = \"ComponentID\"\n  Class = \"DMTF|ComponentID|001\"\n  Id = 1\n"
    "  Start Attribute\n   Name = \"Product\"\n   Id = 1\n   Type = String(64)\n"
    "   Value = \"Disk\"\n  End Attribute\n End Group\n";

inline const std::string kMifEnd = "End Component\n";

/// A whole file without fault; `groups` begins in line 14.
inline std::string mifOf(const std::string& groups) {
    return kMifStart + kComponentId + groups + kMifEnd;
}

/// An attribute in one line; the value stands at the line's end.
inline std::string attributeMif(int id, const std::string& name, const std::string& type,
                                const std::string& value) {
    return "Start Attribute Name = \"" + name + "\" Id = " + std::to_string(id) +
           " Type = " + type + " Value = " + value + " End Attribute\n";
}

/// A group with one instance; two lines before its attributes, and one after.
inline std::string groupMif(int id, const std::string& name, const std::string& className,
                            const std::string& attributes) {
    return "Start Group Name = \"" + name + "\"\nClass = \"" + className +
           "\" Id = " + std::to_string(id) + "\n" + attributes + "End Group\n";
}

/// As the generator writes it: a template with the row number and two attributes, and its rows.
inline std::string tableMif(int id, const std::string& name, const std::string& rows) {
    const std::string className = "Own|" + name + "|001";
    return "Start Group Name = \"" + name + "\" Class = \"" + className + "\" Key = 1\n" +
           attributeMif(1, "Index", "Integer", "1") +
           attributeMif(2, "Device", "String(8)", "\"\"") +
           attributeMif(3, "Speed", "Integer", "0") + "End Group\nStart Table Name = \"" + name +
           "\" Class = \"" + className + "\" Id = " + std::to_string(id) + "\n" + rows +
           "End Table\n";
}

}  // namespace sennetctl
