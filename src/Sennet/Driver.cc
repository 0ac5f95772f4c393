#include "Sennet/Driver.h"

#include <Velm/DirectoryReader.h>
#include <Velm/PlatformUtilities.h>
#include <Velm/PropertiesFile.h>
#include <Velm/TextFile.h>

#include <cstdio>

#include "CimScriptParser/CimScriptParser.h"
#include "Sennet/ConverterFactory.h"
#include "SennetConverter/framework/CimConverter.h"

using namespace Pegasus;

namespace {

constexpr char kScriptPattern[] = ".script.inv";
constexpr char kScriptSuffix[] = ".SCRIPT.INV";
constexpr Uint32 kScriptSuffixLength = sizeof kScriptSuffix - 1;
constexpr Uint32 kTimeoutMilliseconds = 180000;
constexpr int kMakeParents = 1;
constexpr char kUsage[] =
    "Usage: sennet </SMS | /CA | /QVE | /LD> [ <target directory> ]\n"
    "These options are case sensitive.\n";
constexpr char kInvalidType[] =
    "Error -- invalid MIF type specified. This option is case sensitive. Your MIF type is: ";
constexpr int kMessageBytes = 256;

// A command-line argument in the program's encoding.
class ConvertedText {
  public:
    explicit ConvertedText(const char* argument)
        : text(Velm::PlatformUtilities::convertStringFromPlatform(argument)) {}
    ConvertedText(const ConvertedText&) = delete;
    ConvertedText& operator=(const ConvertedText&) = delete;
    ~ConvertedText() { Velm::PlatformUtilities::freeConvertedString(text); }

    const char* get() const { return text; }

  private:
    const char* text;
};

// What one run was asked for.
struct Request {
    String type;
    String mifDirectory;
    String sqlDirectory;
};

[[noreturn]] void refuse(const char* message) {
    std::fputs(message, stdout);
    throw Exception(String(message));
}

[[noreturn]] void refuseType(const char* type) {
    char message[kMessageBytes];
    const int room = kMessageBytes - static_cast<int>(sizeof kInvalidType) - 1;
    std::snprintf(message, sizeof message, "%s%.*s\n", kInvalidType, room, type);
    refuse(message);
}

// A text that is not UTF-8 is no type either, and is named in the message like any other.
bool isValidTypeText(const char* type) {
    try {
        return isValidMIFType(String(type));
    } catch (const Exception&) {
        return false;
    }
}

Request readCommandLine(int argc, char** argv) {
    if (argc < 2) {
        refuse(kUsage);
    }
    const ConvertedText type(argv[1]);
    if (!isValidTypeText(type.get())) {
        refuseType(type.get());
    }
    const auto directory = [&](int i, const char* (*byDefault)(const char*)) {
        return argc > i ? String(ConvertedText(argv[i]).get()) : String(byDefault(type.get()));
    };
    return {String(type.get()), directory(2, Velm::PlatformUtilities::getMIFOutputDirectory),
            directory(3, Velm::PlatformUtilities::getSQLOutputDirectory)};
}

void makeDirectories(const Request& request) {
    Velm::TextFile probe(request.mifDirectory.getCString());
    if (!probe.exists()) {
        probe.mkdir(kMakeParents);
    }
    if (String::equal(request.type, "/QVE")) {
        probe.setFileName(request.sqlDirectory.getCString());
        if (!probe.exists()) {
            probe.mkdir(kMakeParents);
        }
    }
}

// The script's file name without directory and suffix; the path as it is when it has none.
String baseName(const String& path) {
    const auto separator = static_cast<unsigned char>(Velm::PlatformUtilities::getSeparator());
    const Uint32 last = path.reverseFind(Char16(separator));
    const String name = last == PEG_NOT_FOUND ? path : path.subString(last + 1);
    if (name.size() <= kScriptSuffixLength) {
        return path;
    }
    const Uint32 stemLength = name.size() - kScriptSuffixLength;
    return String::equalNoCase(name.subString(stemLength), kScriptSuffix)
               ? name.subString(0, stemLength)
               : path;
}

Array<CIMInstance> fetchInstances(CIMClient& client, const CIMNamespaceName& nameSpace,
                                  const CIMName& className) {
    try {
        return client.enumerateInstances(nameSpace, className, true, false, true, false,
                                         CIMPropertyList());
    } catch (const Exception&) {
        return Array<CIMInstance>();
    }
}

// Adds class and instances of one slot; a class that the server refuses is left out.
void fetchClass(CIMClient& client, const CIMNamespaceName& nameSpace, const CIMName& className,
                Array<CIMClass>& classes, CimInstanceLists& instanceLists) {
    CIMClass cimClass(className);
    try {
        cimClass = client.getClass(nameSpace, className, false, true, false, CIMPropertyList());
    } catch (const CIMException&) {
        return;
    }
    Array<CIMInstance> instances = fetchInstances(client, nameSpace, className);
    classes.append(cimClass);
    instanceLists.addInstanceList(instances);
}

void runScript(const char* path, CIMClient& client, const Request& request,
               const Velm::Properties& properties, CimConverterList& converters) {
    CimScriptParser parser{String(path)};
    parser.parse();
    Array<CIMClass> classes;
    CimInstanceLists instanceLists;
    for (Uint32 j = 0; j < parser.getNumberOfClasses(); ++j) {
        const auto slot = static_cast<int>(j);
        fetchClass(client, parser.getNamespace(slot), CIMName(parser.getClassName(slot)), classes,
                   instanceLists);
    }

    const String script = baseName(String(path));
    createCimConverters(converters, request.type, request.mifDirectory, request.sqlDirectory,
                        script, properties);
    std::printf(
        somethingToPrintOut(classes, instanceLists) ? "Processing %s...\n" : "Deleting %s...\n",
        static_cast<const char*>(script.getCString()));
    for (int k = 0; k < converters.getNumberOfConverters(); ++k) {
        converters.getConverter(k)->printOutput(parser, classes, instanceLists);
    }
}

void run(int argc, char** argv, const Velm::Properties& properties, CimConverterList& converters) {
    std::puts("Corvane CIM to MIF Generator, version 5.20\n");
    const Request request = readCommandLine(argc, argv);
    makeDirectories(request);
    std::printf("Creating MIF files in %s\n",
                static_cast<const char*>(request.mifDirectory.getCString()));

    const Velm::DirectoryReader scripts(Velm::PlatformUtilities::getSennetDirectory(),
                                        kScriptPattern);
    CIMClient client;
    client.setTimeout(kTimeoutMilliseconds);
    client.connectLocal();
    for (int i = 0; i < scripts.getNumberOfFiles(); ++i) {
        try {
            runScript(scripts.getFileName(i), client, request, properties, converters);
        } catch (const Exception&) {
            // One script's trouble must not cost the others their output.
            continue;
        }
    }
    client.disconnect();
}

}  // namespace

bool isValidMIFType(const String& type) {
    for (const char* valid : {"/SMS", "/CA", "/QVE", "/LD"}) {
        if (String::equal(type, valid)) {
            return true;
        }
    }
    return false;
}

bool somethingToPrintOut(const Array<CIMClass>& classes, const CimInstanceLists& instanceLists) {
    return holdsData(classes, instanceLists);
}

const char* getTranslatedString(const char* key, Velm::Properties properties) {
    const char* translation = properties.getPropertyValue(key);
    return translation != nullptr ? translation : key;
}

int runSennet(int argc, char** argv) {
    // Progress shows line by line through a pipe, too.
    std::setvbuf(stdout, nullptr, _IOLBF, BUFSIZ);

    // The converters are destroyed last: that completes the files of the last script.
    CimConverterList converters;
    Velm::PropertiesFile propertiesFile(Velm::PlatformUtilities::getSennetResourceFile());
    propertiesFile.load();
    const Velm::Properties properties(propertiesFile.getProperties());
    try {
        run(argc, argv, properties, converters);
    } catch (const Exception&) {
        return 1;
    }
    return 0;
}
