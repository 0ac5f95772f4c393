// What the generator's unit tests share: an inventory script written to a temporary directory,
// CIM classes and instances built in a line each, and a converter run through its whole life.

#pragma once

#include <Pegasus/Client/CIMClient.h>
#include <Velm/Properties.h>
#include <gtest/gtest.h>

#include <filesystem>
#include <initializer_list>
#include <memory>
#include <string>
#include <utility>
#include <vector>

#include "CimScriptParser/CimScriptParser.h"
#include "SennetConverter/framework/CimInstanceLists.h"
#include "support/Files.h"
#include "support/LineEnds.h"
#include "support/TempDirectory.h"

namespace generatortest {

/// The UTF-8 bytes of a CIM string.
inline std::string utf8(const Pegasus::String& text) {
    return std::string(static_cast<const char*>(text.getCString()));
}

using support::crlf;

template <typename T>
Pegasus::Array<T> arrayOf(std::initializer_list<T> elements) {
    Pegasus::Array<T> result;
    for (const T& element : elements) {
        result.append(element);
    }
    return result;
}

/// An array of CIM strings from UTF-8 texts.
Pegasus::Array<Pegasus::String> strings(std::initializer_list<const char*> texts);

/// A string value.
Pegasus::CIMValue text(const char* utf8);
/// A null scalar of the type.
Pegasus::CIMValue null(Pegasus::CIMType type);
/// A null array of the type.
Pegasus::CIMValue nullArray(Pegasus::CIMType type);

/// A property with qualifiers, in the order given.
Pegasus::CIMProperty property(const char* name, const Pegasus::CIMValue& value,
                              std::initializer_list<Pegasus::CIMQualifier> qualifiers = {});

/// A qualifier holding strings, such as Values and ValueMap.
Pegasus::CIMQualifier textsQualifier(const char* name, std::initializer_list<const char*> texts);
/// A MaxLen qualifier of type uint32.
Pegasus::CIMQualifier maxLen(Pegasus::Uint32 length);

Pegasus::CIMClass cimClass(const char* name,
                           std::initializer_list<Pegasus::CIMProperty> properties);
Pegasus::CIMInstance cimInstance(const char* name,
                                 std::initializer_list<Pegasus::CIMProperty> properties);

/// A class with its instances, as a server would answer for one slot of a script.
struct Answer {
    Pegasus::CIMClass cimClass;
    std::vector<Pegasus::CIMInstance> instances;
};

/// The class array and the instance lists that the run driver would hand to a converter.
struct Inventory {
    explicit Inventory(const std::vector<Answer>& answers);

    Pegasus::Array<Pegasus::CIMClass> classes;
    Pegasus::CimInstanceLists lists;
};

class ConverterFixture : public ::testing::Test {
  protected:
    /// A parsed script of this text; its file is named `<stem>.script.inv`.
    Pegasus::CimScriptParser& script(const std::string& text, const std::string& stem = "cpu");

    /// A path in the test's own directory.
    std::string path(const std::string& name) const;

    /// Runs a converter of the type over one script and gives the bytes of its file.
    template <typename Converter>
    std::string convert(const std::string& scriptText, const std::vector<Answer>& answers,
                        unsigned int limit = 30) {
        Inventory inventory(answers);
        {
            Converter converter(outputName(), properties, limit);
            converter.printOutput(script(scriptText), inventory.classes, inventory.lists);
        }
        return output();
    }

    Pegasus::String outputName() const { return Pegasus::String(path("out.mif").c_str()); }
    /// The bytes of that file.
    virtual std::string output() const;
    bool outputExists() const { return std::filesystem::exists(path("out.mif")); }

    Velm::Properties properties;

  private:
    support::TempDirectory directory;
    std::vector<std::unique_ptr<Pegasus::CimScriptParser>> parsers;
};

}  // namespace generatortest
