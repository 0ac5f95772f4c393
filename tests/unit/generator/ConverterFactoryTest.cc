// Which converters a product gets, where they write, and how long they live.

#include "Sennet/ConverterFactory.h"

#include <gtest/gtest.h>

#include <string>
#include <typeinfo>
#include <vector>

#include "ConverterFixture.h"
#include "SennetConverter/mif/CaSennetConverter.h"
#include "SennetConverter/mif/LdmsSennetConverter.h"
#include "SennetConverter/mif/QveLumoSennetConverter.h"
#include "SennetConverter/mif/QveSennetConverter.h"
#include "SennetConverter/mif/SmsSennetConverter.h"
#include "SennetConverter/shell/Cim2ShConverter.h"
#include "SennetConverter/shell/LumoCim2ShConverter.h"
#include "SennetConverter/sql/LumoCim2SqlConverter.h"
#include "SennetConverter/sql/MSCim2SqlConverter.h"
#include "SennetConverter/sql/OracleCim2SqlConverter.h"
#include "SennetConverter/sql/SybaseCim2SqlConverter.h"

namespace {

using namespace Pegasus;
using generatortest::utf8;

class ConverterFactoryTest : public generatortest::ConverterFixture {
  protected:
    ConverterFactoryTest() {
        std::filesystem::create_directory(path("mif"));
        std::filesystem::create_directory(path("sql"));
    }

    void create(const char* type, const char* scriptName) {
        createCimConverters(list, type, String(path("mif").c_str()), String(path("sql").c_str()),
                            scriptName, properties);
    }

    /// A file of an earlier run; the converter that is to write it removes it at its end.
    void leaveStale(const std::string& name) { support::writeFile(path(name), "stale"); }
    bool exists(const std::string& name) const { return std::filesystem::exists(path(name)); }

    template <typename Converter>
    bool isA(int index) const {
        const CimConverter* converter = list.getConverter(index);
        return converter != nullptr && typeid(*converter) == typeid(Converter);
    }

    /// Whether the converter shortens a name of 14 characters, as a limit of 18 demands.
    bool shortens(int index) const {
        return utf8(list.getConverter(index)->hashString("ABCDEFGHIJKLMN")) != "ABCDEFGHIJKLMN";
    }
    /// Whether it shortens one of 26 characters, as a limit of 30 demands.
    bool shortensLong(int index) const {
        return utf8(list.getConverter(index)->hashString("0000000000000000000000000z")) ==
               "00000000000000000000001p";
    }

    CimConverterList list;
};

const std::vector<std::string> kQveFiles = {
    "mif/kwvinv.mif",
    "mif/kwinvlumo.mif",
    "sql/kwv_cpu_ms_schema.sql",
    "sql/kwv_cpu_oracle_schema.sql",
    "sql/kwv_cpu_sybase_schema.sql",
    "sql/kwv_cpu_lumo_schema.sql",
    "sql/kwv_cpu_queries.sh",
    "sql/kwv_cpu_queries_lumo.sh",
};

TEST_F(ConverterFactoryTest, MakesOneConverterPerScriptForSms) {
    leaveStale("mif/cpu.mif");
    leaveStale("mif/disk.mif");
    create("/SMS", "cpu");
    ASSERT_EQ(list.getNumberOfConverters(), 1);
    EXPECT_TRUE(isA<SmsSennetConverter>(0));
    EXPECT_TRUE(exists("mif/cpu.mif"));
    create("/SMS", "disk");
    EXPECT_FALSE(exists("mif/cpu.mif"));
    EXPECT_TRUE(exists("mif/disk.mif"));
    ASSERT_EQ(list.getNumberOfConverters(), 1);
    list.clearAndDelete();
    EXPECT_FALSE(exists("mif/disk.mif"));
}

TEST_F(ConverterFactoryTest, MakesOneConverterPerScriptForLandesk) {
    leaveStale("mif/cpu.mif");
    create("/LD", "cpu");
    ASSERT_EQ(list.getNumberOfConverters(), 1);
    EXPECT_TRUE(isA<LdmsSennetConverter>(0));
    create("/LD", "disk");
    EXPECT_FALSE(exists("mif/cpu.mif"));
    EXPECT_EQ(list.getNumberOfConverters(), 1);
}

TEST_F(ConverterFactoryTest, KeepsOneConverterForCa) {
    leaveStale("mif/kwvinv.mif");
    create("/CA", "cpu");
    ASSERT_EQ(list.getNumberOfConverters(), 1);
    EXPECT_TRUE(isA<CaSennetConverter>(0));
    const CimConverter* first = list.getConverter(0);
    create("/CA", "disk");
    ASSERT_EQ(list.getNumberOfConverters(), 1);
    EXPECT_EQ(list.getConverter(0), first);
    EXPECT_TRUE(exists("mif/kwvinv.mif"));
    list.clearAndDelete();
    EXPECT_FALSE(exists("mif/kwvinv.mif"));
}

TEST_F(ConverterFactoryTest, MakesEightConvertersForQve) {
    create("/QVE", "cpu");
    ASSERT_EQ(list.getNumberOfConverters(), 8);
    EXPECT_TRUE(isA<QveSennetConverter>(0));
    EXPECT_TRUE(isA<QveLumoSennetConverter>(1));
    EXPECT_TRUE(isA<MSCim2SqlConverter>(2));
    EXPECT_TRUE(isA<OracleCim2SqlConverter>(3));
    EXPECT_TRUE(isA<SybaseCim2SqlConverter>(4));
    EXPECT_TRUE(isA<LumoCim2SqlConverter>(5));
    EXPECT_TRUE(isA<Cim2ShConverter>(6));
    EXPECT_TRUE(isA<LumoCim2ShConverter>(7));
}

TEST_F(ConverterFactoryTest, NamesTheFilesOfQve) {
    for (const std::string& name : kQveFiles) {
        leaveStale(name);
    }
    create("/QVE", "cpu");
    list.clearAndDelete();
    for (const std::string& name : kQveFiles) {
        EXPECT_FALSE(exists(name)) << name;
    }
}

TEST_F(ConverterFactoryTest, KeepsTheTwoMifConvertersOfQve) {
    for (const std::string& name : kQveFiles) {
        leaveStale(name);
    }
    create("/QVE", "cpu");
    const CimConverter* mif = list.getConverter(0);
    const CimConverter* lumo = list.getConverter(1);
    leaveStale("sql/kwv_disk_queries.sh");
    create("/QVE", "disk");
    ASSERT_EQ(list.getNumberOfConverters(), 8);
    EXPECT_EQ(list.getConverter(0), mif);
    EXPECT_EQ(list.getConverter(1), lumo);
    EXPECT_TRUE(isA<MSCim2SqlConverter>(2));
    EXPECT_TRUE(isA<LumoCim2ShConverter>(7));
    EXPECT_TRUE(exists("mif/kwvinv.mif"));
    EXPECT_TRUE(exists("mif/kwinvlumo.mif"));
    for (size_t i = 2; i < kQveFiles.size(); ++i) {
        EXPECT_FALSE(exists(kQveFiles[i])) << kQveFiles[i];
    }
    EXPECT_TRUE(exists("sql/kwv_disk_queries.sh"));
}

TEST_F(ConverterFactoryTest, LimitsNamesTo18ForLumoOnly) {
    create("/QVE", "cpu");
    for (int index = 0; index < 8; ++index) {
        const bool lumo = index == 1 || index == 5 || index == 7;
        EXPECT_EQ(shortens(index), lumo) << index;
        EXPECT_EQ(shortensLong(index), !lumo) << index;
    }
}

TEST_F(ConverterFactoryTest, IgnoresTheCaseOfTheType) {
    create("/sms", "cpu");
    EXPECT_TRUE(isA<SmsSennetConverter>(0));
    list.clearAndDelete();
    create("/Ld", "cpu");
    EXPECT_TRUE(isA<LdmsSennetConverter>(0));
    list.clearAndDelete();
    create("/ca", "cpu");
    EXPECT_TRUE(isA<CaSennetConverter>(0));
    list.clearAndDelete();
    create("/qve", "cpu");
    EXPECT_EQ(list.getNumberOfConverters(), 8);
}

TEST_F(ConverterFactoryTest, LeavesTheListAloneForOtherTypes) {
    create("/XYZ", "cpu");
    EXPECT_EQ(list.getNumberOfConverters(), 0);
    create("/SMS", "cpu");
    const CimConverter* first = list.getConverter(0);
    for (const char* type : {"", "SMS", "/SMS ", "/QV"}) {
        create(type, "disk");
        EXPECT_EQ(list.getNumberOfConverters(), 1) << type;
        EXPECT_EQ(list.getConverter(0), first) << type;
    }
}

TEST_F(ConverterFactoryTest, JoinsDirectoryAndNameAsTheyAre) {
    std::filesystem::create_directories(path("mif/opt/scripts"));
    leaveStale("mif/opt/scripts/.script.inv.mif");
    create("/SMS", "/opt/scripts/.script.inv");
    list.clearAndDelete();
    EXPECT_FALSE(exists("mif/opt/scripts/.script.inv.mif"));
}

}  // namespace
