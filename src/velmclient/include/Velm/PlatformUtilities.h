// Where the platform keeps the generator's files, and how it encodes text.
//
// The places come from the configuration file velmira/velm.properties below the system
// configuration directory, or from the file that the environment variable VELM_CONFIG names (not
// heeded in a privileged program). It is read once, at the first question. A key that is absent or
// has an empty value stands for a directory below the installation prefix. Every path that is
// returned ends in NUL and stays valid to the end of the process; relative paths are given as
// configured. All functions may be called from any thread.
#pragma once

namespace Velm {

class PlatformUtilities {
  public:
    PlatformUtilities() = delete;

    // The resource properties file (key sennet.resources).
    static const char* getSennetResourceFile();

    // The generator's own directory, where the inventory scripts are (key sennet.directory).
    static const char* getSennetDirectory();

    // The default directory of MIF files for a type text such as "/SMS": key mif.directory.SMS,
    // else mif.directory. A null or empty type asks for the latter.
    static const char* getMIFOutputDirectory(const char* type);

    // The default directory of SQL and query scripts, likewise (keys sql.directory.QVE, ...).
    static const char* getSQLOutputDirectory(const char* type);

    // The character between the parts of a path.
    static char getSeparator();

    // The text, given in the encoding of the environment's locale, in UTF-8. Byte sequences that
    // cannot be converted are kept as they are. Null gives null. To be released with
    // freeConvertedString.
    static const char* convertStringFromPlatform(const char* text);

    // Releases a text that convertStringFromPlatform returned; null is allowed.
    static void freeConvertedString(const char* text);
};

}  // namespace Velm
