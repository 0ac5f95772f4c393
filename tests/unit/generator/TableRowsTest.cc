// Rows that a second document takes over from the first.

#include "SennetConverter/mif/TableRows.h"

#include <gtest/gtest.h>

#include <deque>
#include <string>

#include "ConverterFixture.h"
#include "SennetConverter/mif/QveLumoSennetConverter.h"

namespace {

using namespace Pegasus;
using namespace generatortest;

CIMInstance fan(const char* name) {
    return cimInstance("CIM_Fan", {property("Name", text(name))});
}

const CIMClass& fanClass() {
    static const CIMClass described = cimClass(
        "CIM_Fan", {property("Name", null(CIMTYPE_STRING)), property("Kind", text("axial"))});
    return described;
}

Inventory fans(std::initializer_list<const char*> names) {
    Answer answer{fanClass(), {}};
    for (const char* name : names) {
        answer.instances.push_back(fan(name));
    }
    return Inventory({answer});
}

std::string joined(const std::deque<std::string>& texts) {
    std::string all;
    for (const std::string& text : texts) {
        all += text;
    }
    return all;
}

class TableRowsTest : public ConverterFixture {
  protected:
    const QveSennetConverter writer{outputName(), properties, 30};
    const QveSennetConverter reader{outputName(), properties, 30};
};

TEST_F(TableRowsTest, AreThoseOfTheVeryInstances) {
    const Inventory one = fans({"a"});
    const Inventory equal = fans({"a"});
    TableRows rows;
    EXPECT_FALSE(rows.show(one.lists, reader));
    rows.start(one.lists, writer);
    rows.add("row 1\r\n");
    rows.add("row 2\r\n");
    EXPECT_TRUE(rows.show(one.lists, reader));
    EXPECT_FALSE(rows.show(equal.lists, reader));
    EXPECT_FALSE(rows.show(one.lists, writer));
    EXPECT_EQ(joined(rows.take()), "row 1\r\nrow 2\r\n");
    EXPECT_FALSE(rows.show(one.lists, reader));
}

TEST_F(TableRowsTest, AreForgottenWhenOthersAreWritten) {
    const Inventory one = fans({"a"});
    const Inventory other = fans({"b"});
    TableRows rows;
    rows.start(one.lists, writer);
    rows.add("one");
    rows.start(other.lists, writer);
    rows.add("other");
    EXPECT_FALSE(rows.show(one.lists, reader));
    EXPECT_TRUE(rows.show(other.lists, reader));
    EXPECT_EQ(joined(rows.take()), "other");
}

TEST_F(TableRowsTest, AreNotKeptBeyondALimit) {
    const Inventory one = fans({"a"});
    const std::string mebibyte(std::size_t{1} << 20, 'x');
    TableRows rows;
    rows.start(one.lists, writer);
    for (std::size_t octets = 0; octets < TableRows::kMostOctets; octets += mebibyte.size()) {
        rows.add(mebibyte);
    }
    EXPECT_TRUE(rows.show(one.lists, reader));
    rows.add("x");
    EXPECT_FALSE(rows.show(one.lists, reader));
    EXPECT_TRUE(rows.take().empty());

    rows.start(one.lists, writer);
    rows.add("row 1\r\n");
    EXPECT_TRUE(rows.show(one.lists, reader)) << "the next table begins anew";
}

TEST_F(TableRowsTest, AreNotThoseOfMoreOrFewerClasses) {
    Array<CIMInstance> first(1, fan("a"));
    Array<CIMInstance> second(1, fan("b"));
    CimInstanceLists one;
    one.addInstanceList(first);
    CimInstanceLists both;
    both.addInstanceList(first);
    both.addInstanceList(second);
    CimInstanceLists swapped;
    swapped.addInstanceList(second);
    swapped.addInstanceList(first);
    TableRows rows;
    rows.start(both, writer);
    EXPECT_TRUE(rows.show(both, reader));
    EXPECT_FALSE(rows.show(one, reader));
    EXPECT_FALSE(rows.show(swapped, reader));
    EXPECT_FALSE(rows.show(CimInstanceLists(), reader));
    rows.start(CimInstanceLists(), writer);
    EXPECT_FALSE(rows.show(CimInstanceLists(), reader));
}

TEST_F(TableRowsTest, AreAnyNumberOfAnySize) {
    const Inventory one = fans({"a"});
    TableRows rows;
    rows.start(one.lists, writer);
    std::string expected;
    for (int i = 0; i < 100; ++i) {
        const std::string row(i == 50 ? 200000 : 3000, static_cast<char>('!' + i % 90));
        rows.add(row);
        expected += row;
    }
    EXPECT_EQ(joined(rows.take()), expected);
}

class SharedRows : public ConverterFixture {
  protected:
    // Prints one script after the other to both documents, as the driver does, and gives the lines
    // of their tables that are rows.
    struct Script {
        const char* text;
        Inventory inventory;
    };
    std::string rowsAfter(std::vector<Script> scripts) {
        {
            QveSennetConverter plain(outputName(), properties, 30);
            QveLumoSennetConverter lumo(String(path("lumo.mif").c_str()), properties, 18);
            plain.shareRows(lumo);
            for (Script& each : scripts) {
                CimScriptParser& parser = script(each.text);
                try {
                    plain.printOutput(parser, each.inventory.classes, each.inventory.lists);
                    lumo.printOutput(parser, each.inventory.classes, each.inventory.lists);
                } catch (const InvalidNameException&) {
                    ++abandoned;
                }
            }
        }
        const std::string rows = rowsIn(output());
        EXPECT_EQ(rowsIn(support::readFile(path("lumo.mif"))), rows);
        return rows;
    }

    static std::string rowsIn(const std::string& document) {
        std::string rows;
        for (std::size_t at = document.find("      {"); at != std::string::npos;
             at = document.find("      {", at + 1)) {
            rows += document.substr(at + 6, document.find('\r', at) - at - 6) + "\n";
        }
        return rows;
    }

    int abandoned = 0;
};

constexpr const char* kNames = "[DEFAULT]\ntitle=Names\n[CIM]\nG[0]=CIM_Fan\nA[0]=Name\n";
constexpr const char* kKinds = "[DEFAULT]\ntitle=Kinds\n[CIM]\nG[0]=CIM_Fan\nA[0]=Kind,Name\n";
constexpr const char* kNothing = "[DEFAULT]\ntitle=Nothing\n[CIM]\nG[0]=CIM_Fan\n";
constexpr const char* kFaulty = "[DEFAULT]\ntitle=Bad\n[CIM]\nG[0]=CIM_Fan\nA[0]=Name,\n";

TEST_F(SharedRows, AreThoseOfEachScriptInBothDocuments) {
    EXPECT_EQ(rowsAfter({{kNames, fans({"a", "b"})}, {kKinds, fans({"c"})}}),
              "{ \"1    \", \"a\"}\n"
              "{ \"2    \", \"b\"}\n"
              "{ \"1    \", \"axial\",\"c\"}\n");
}

TEST_F(SharedRows, AreNoneOfAScriptWithoutInstances) {
    EXPECT_EQ(rowsAfter({{kNames, fans({"a"})}, {kNames, fans({})}, {kKinds, fans({"b"})}}),
              "{ \"1    \", \"a\"}\n"
              "{ \"1    \", \"axial\",\"b\"}\n");
}

TEST_F(SharedRows, AreEmptyWithoutAPropertyList) {
    EXPECT_EQ(rowsAfter({{kNothing, fans({"a", "b"})}, {kNames, fans({"c"})}}),
              "{ \"1    \", }\n"
              "{ \"2    \", }\n"
              "{ \"1    \", \"c\"}\n");
}

TEST_F(SharedRows, AreNotTakenFromTheSameDocument) {
    Inventory same = fans({"a"});
    {
        QveSennetConverter plain(outputName(), properties, 30);
        QveLumoSennetConverter lumo(String(path("lumo.mif").c_str()), properties, 18);
        plain.shareRows(lumo);
        plain.printOutput(script(kNames), same.classes, same.lists);
        plain.printOutput(script(kKinds), same.classes, same.lists);
        lumo.printOutput(script(kKinds), same.classes, same.lists);
    }
    EXPECT_EQ(rowsIn(output()),
              "{ \"1    \", \"a\"}\n"
              "{ \"1    \", \"axial\",\"a\"}\n");
    EXPECT_EQ(rowsIn(support::readFile(path("lumo.mif"))), "{ \"1    \", \"axial\",\"a\"}\n");
}

TEST_F(SharedRows, AreNotLeftOverFromAnAbandonedScript) {
    EXPECT_EQ(rowsAfter({{kFaulty, fans({"a"})}, {kNames, fans({"b"})}, {kFaulty, fans({"c"})}}),
              "{ \"1    \", \"b\"}\n");
    EXPECT_EQ(abandoned, 2);
}

}  // namespace
