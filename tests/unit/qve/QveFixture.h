// What the tests of the schema and query script writers share: a small inventory, and the fixed
// text of each kind of script around the columns in question.

#pragma once

#include <string>
#include <vector>

#include "unit/generator/ConverterFixture.h"

namespace qvetest {

using namespace Pegasus;
using namespace generatortest;

/// Name lengths that the factory gives the writers for Lumo databases and all others.
inline constexpr unsigned int kLumoLimit = 18;
inline constexpr unsigned int kLimit = 30;

/// A schema script of the dialect for the table stem; `columns` holds the property columns, each
/// from the three blanks before its name to the end of its text, with LF between them.
std::string lumoSchema(const std::string& stem, const std::string& columns);
std::string transactSchema(const std::string& stem, const std::string& columns);
std::string oracleSchema(const std::string& stem, const std::string& columns);

/// A query script for the display title, view stem, column names and raw title.
std::string queryScript(const std::string& displayTitle, const std::string& viewStem,
                        const std::vector<std::string>& columns, const std::string& title);

/// A script titled T of one class CIM_X with this property list.
std::string scriptOf(const std::string& propertyList);

/// A script of one class CIM_X with the one property P under this title.
std::string titled(const std::string& title);

class QveFixture : public ConverterFixture {
  protected:
    /// The class with one instance that has no values.
    static Answer described(const CIMClass& cimClass);

    /// CIM_X with the string property P of 8 characters, and an instance.
    static Answer plain();

    /// CIM_X with these string properties, none of them with a length, and an instance.
    static Answer texts(std::initializer_list<const char*> names);

    /// The file of a Converter whose script names an impossible property in its second class. The
    /// first class has the columns A and B.
    template <typename Converter>
    std::string convertUpToBadList(unsigned int limit) {
        Inventory inventory({described(cimClass("CIM_X", {property("A", null(CIMTYPE_STRING)),
                                                          property("B", null(CIMTYPE_STRING))})),
                             described(cimClass("CIM_Y", {}))});
        {
            Converter converter(outputName(), properties, limit);
            CimScriptParser& parser =
                script("[DEFAULT]\ntitle=T\n[CIM]\nG[0]=CIM_X\nA[0]=A,B\nG[1]=CIM_Y\nA[1]=C,D,\n");
            EXPECT_THROW(converter.printOutput(parser, inventory.classes, inventory.lists),
                         InvalidNameException);
        }
        return output();
    }

    /// Expects that a Converter leaves the file of its name alone until it ends, and removes it
    /// then, when no class has instances and when there is no class.
    template <typename Converter>
    void expectNothingWritten() {
        Inventory withoutInstances({{plain().cimClass, {}}});
        Inventory withoutClasses({});
        Inventory others({plain()});
        support::writeFile(path("out.mif"), "stale");
        {
            Converter converter(outputName(), properties, kLimit);
            converter.printOutput(script(titled("T")), withoutInstances.classes,
                                  withoutInstances.lists);
            converter.printOutput(script(titled("T")), withoutClasses.classes, others.lists);
            EXPECT_EQ(output(), "stale");
        }
        EXPECT_FALSE(outputExists());
    }
};

}  // namespace qvetest
