// Fuzzes what is made of a server's answers, for every product: files of a bounded size, and MIF
// files that the strict reader takes.
//
// The first line of the octets lists the properties of an inventory script, the second has the
// members of its class, and each further line those of an instance.

#include <Pegasus/Common/Exception.h>

#include <algorithm>
#include <cctype>
#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

#include "CimScriptParser/CimScriptParser.h"
#include "Require.h"
#include "Sennet/ConverterFactory.h"
#include "SennetConverter/framework/CimConverter.h"
#include "SennetConverter/framework/CimInstanceLists.h"
#include "mifreader/MifReader.h"
#include "support/TempDirectory.h"
#include "xml/CimXmlReader.h"
#include "xml/MemorySource.h"

namespace {

using Pegasus::Array;
using Pegasus::CIMClass;
using Pegasus::CIMInstance;
using Pegasus::String;

constexpr std::size_t kMostInstances = 50;

struct Input {
    std::string_view properties;
    std::string_view classMembers;
    std::string_view instances;
};

std::string_view takeLine(std::string_view& text) {
    const std::size_t end = std::min(text.find('\n'), text.size());
    const std::string_view line = text.substr(0, end);
    text.remove_prefix(std::min(end + 1, text.size()));
    return line;
}

std::string answer(const std::string& operation, const std::string& objects) {
    return "<CIM CIMVERSION=\"2.0\" DTDVERSION=\"2.0\"><MESSAGE ID=\"7\" PROTOCOLVERSION=\"1.0\">"
           "<SIMPLERSP><IMETHODRESPONSE NAME=\"" +
           operation + "\"><IRETURNVALUE>" + objects +
           "</IRETURNVALUE></IMETHODRESPONSE></SIMPLERSP></MESSAGE></CIM>";
}

CIMClass classOf(const Input& input) {
    const std::string text = answer(
        "GetClass", "<CLASS NAME=\"T_Thing\">" + std::string(input.classMembers) + "</CLASS>");
    Pegasus::MemorySource source(text, text.size());
    return Pegasus::decodeGetClassResponse(source, "7");
}

Array<CIMInstance> instancesOf(const Input& input) {
    std::string objects;
    std::string_view rest = input.instances;
    for (std::size_t i = 0; i < kMostInstances && !rest.empty(); ++i) {
        objects +=
            "<VALUE.NAMEDINSTANCE><INSTANCENAME CLASSNAME=\"T_Thing\"/>"
            "<INSTANCE CLASSNAME=\"T_Thing\">";
        objects += takeLine(rest);
        objects += "</INSTANCE></VALUE.NAMEDINSTANCE>";
    }
    const std::string text = answer("EnumerateInstances", objects);
    Pegasus::MemorySource source(text, text.size());
    return Pegasus::decodeEnumerateInstancesResponse(source, "7");
}

bool has(std::string_view text, std::string_view wanted) {
    return std::search(text.begin(), text.end(), wanted.begin(), wanted.end(), [](char a, char b) {
               return std::tolower(static_cast<unsigned char>(a)) == b;
           }) != text.end();
}

bool isPlainList(std::string_view properties) {
    const auto isPlain = [](char c) { return c >= ' ' && c <= '~'; };
    const auto isNamePart = [](char c) {
        return std::isalpha(static_cast<unsigned char>(c)) || c == '_';
    };
    return std::all_of(properties.begin(), properties.end(), isPlain) &&
           std::any_of(properties.begin(), properties.end(), isNamePart);
}

// Names beyond ASCII are written as they are, and so is MaxLen. References and objects are cut when
// their quotes are escaped already. A row without properties ends in a comma.
bool isReadable(const Input& input) {
    const bool isPlainClass = !has(input.classMembers, "&") && !has(input.classMembers, "maxlen");
    const auto isCut = [](std::string_view text) {
        return has(text, "reference") || has(text, "embeddedobject");
    };
    return isPlainList(input.properties) && isPlainClass && !isCut(input.classMembers) &&
           !isCut(input.instances);
}

// A value for CA that ends in a backslash keeps its closing quote from being one.
bool hasBackslashes(const Input& input) {
    return has(input.classMembers, "\\") || has(input.instances, "\\") ||
           has(input.instances, "&#");
}

// The octets that a file may have: for each row and column a name and two values that are all
// escapes, in any of the formats.
std::size_t bound(const Input& input, std::size_t rows) {
    const auto columns = static_cast<std::size_t>(
        1 + std::count(input.properties.begin(), input.properties.end(), ','));
    return 8192 + (rows + 2) * (columns * 1200 + 3 * input.properties.size());
}

class Outputs {
  public:
    explicit Outputs(const Input& theInput)
        : input(theInput),
          classes(1, classOf(input)),
          instances(instancesOf(input)),
          parser(scripts
                     .write("thing.script.inv",
                            "[DEFAULT]\ntitle=Thing\n\n[CIM]\nG[0]=T_Thing\n"
                            "N[0]=root/cimv2\nA[0]=" +
                                std::string(input.properties) + "\n")
                     .c_str()) {
        parser.parse();
    }

    /// Makes a product's files. Where `isRead` is true, its MIF files are read, too.
    void check(const char* product, bool isRead) {
        const support::TempDirectory directory;
        const bool isWhole = convert(product, directory.path().c_str());
        for (const std::string& name : directory.names()) {
            const std::string text = directory.read(name);
            require(text.size() <= bound(input, instances.size()));
            if (isWhole && isRead && name.ends_with(".mif")) {
                requireRows(text);
            }
        }
        require(!isWhole || directory.names().empty() == (instances.size() == 0));
    }

  private:
    // False for a script with a name that is none. Whatever the server says, nothing else may raise
    // an exception, which would leave half a file.
    bool convert(const char* product, const char* directory) {
        Pegasus::CimInstanceLists lists;
        Array<CIMInstance> list = instances;
        lists.addInstanceList(list);
        const Velm::Properties properties;
        Pegasus::CimConverterList converters;
        createCimConverters(converters, product, directory, directory, "thing", properties);
        try {
            for (int i = 0; i < converters.getNumberOfConverters(); ++i) {
                converters.getConverter(i)->printOutput(parser, classes, lists);
            }
        } catch (const Pegasus::InvalidNameException&) {
            return false;
        }
        return true;
    }

    void requireRows(const std::string& text) const {
        using enum Mif::Tolerance;
        Mif::Tolerances tolerances{RawLineEnds,  IntegersAsText, TextAsIntegers, UnsignedIntegers,
                                   LongLiterals, RepeatedNames,  AnyDates};
        const Mif::Component component = Mif::MifReader(tolerances).read(text);
        if (component.tables.empty()) {
            require(component.groups.size() == instances.size());
        } else {
            require(component.tables.size() == 1);
            require(component.tables.front().rows.size() == instances.size());
        }
    }

    const Input& input;
    Array<CIMClass> classes;
    Array<CIMInstance> instances;
    support::TempDirectory scripts;
    Pegasus::CimScriptParser parser;
};

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    Input input;
    input.instances = std::string_view(reinterpret_cast<const char*>(data), size);
    input.properties = takeLine(input.instances);
    input.classMembers = takeLine(input.instances);
    std::optional<Outputs> outputs;
    try {
        outputs.emplace(input);
    } catch (const Pegasus::Exception&) {
        return 0;  // refused as a whole
    }
    const bool isRead = isReadable(input);
    for (const char* product : {"/SMS", "/LD", "/QVE"}) {
        outputs->check(product, isRead);
    }
    outputs->check("/CA", isRead && !hasBackslashes(input));
    return 0;
}
