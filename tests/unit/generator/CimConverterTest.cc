// The converter base: the life of its output file and the names that the properties give.

#include "SennetConverter/framework/CimConverter.h"

#include <gtest/gtest.h>

#include <memory>
#include <string>

#include "ConverterFixture.h"
#include "SennetConverter/mif/QveLumoSennetConverter.h"
#include "SennetConverter/mif/QveSennetConverter.h"
#include "SennetConverter/mif/SmsSennetConverter.h"

namespace {

using namespace Pegasus;
using generatortest::utf8;

class PlainConverter : public CimConverter {
  public:
    using CimConverter::CimConverter;
    void printOutput(CimScriptParser&, Array<CIMClass>&, CimInstanceLists&) override {}
};

/// Marks what its two virtual steps were given.
class MarkingConverter : public PlainConverter {
  public:
    using PlainConverter::PlainConverter;
    String hashString(String text) override { return String("#") + text; }
    String substituteValues(String text) override { return String("<") + text + String(">"); }
};

class CimConverterTest : public generatortest::ConverterFixture {
  protected:
    template <typename Converter = PlainConverter>
    std::string title(const char* text, unsigned int limit = 30) {
        Converter converter(outputName(), properties, limit);
        return utf8(converter.formatTitle(text));
    }
    std::string name(const char* section, const char* property) {
        PlainConverter converter(outputName(), properties, 30);
        return utf8(converter.getTranslatedPropertyName(section, property));
    }
    void leaveStaleOutput() { support::writeFile(path("out.mif"), "stale"); }
};

TEST_F(CimConverterTest, RemovesAStaleFileWhenItWroteNothing) {
    leaveStaleOutput();
    { PlainConverter converter(outputName(), properties, 30); }
    EXPECT_FALSE(outputExists());
}

TEST_F(CimConverterTest, IsDeletedThroughItsBase) {
    leaveStaleOutput();
    std::unique_ptr<CimConverter> converter =
        std::make_unique<MarkingConverter>(outputName(), properties, 30U);
    EXPECT_TRUE(outputExists());
    converter.reset();
    EXPECT_FALSE(outputExists());
}

TEST_F(CimConverterTest, LeavesNoFileWhenItOnlyOpened) {
    {
        PlainConverter converter(outputName(), properties, 30);
        converter.openFileIfNeeded();
        converter.openFileIfNeeded();
    }
    EXPECT_FALSE(outputExists());
}

TEST_F(CimConverterTest, KeepsAnEmptyFileAfterAnEmptyText) {
    {
        PlainConverter converter(outputName(), properties, 30);
        converter.openFileIfNeeded();
        converter.Output("");
    }
    ASSERT_TRUE(outputExists());
    EXPECT_EQ(output(), "");
}

TEST_F(CimConverterTest, WritesTextsAsGiven) {
    leaveStaleOutput();
    {
        PlainConverter converter(outputName(), properties, 30);
        converter.openFileIfNeeded();
        converter.Output("one\r\ntw");
        converter.openFileIfNeeded();
        converter.Output("o\nthree");
    }
    EXPECT_EQ(output(), "one\r\ntwo\nthree");
}

TEST_F(CimConverterTest, ShowsTheFileWhenItIsClosed) {
    PlainConverter converter(outputName(), properties, 30);
    converter.openFileIfNeeded();
    converter.Output("whole");
    converter.closeFile();
    EXPECT_EQ(output(), "whole");
    converter.closeFile();
    EXPECT_EQ(output(), "whole");
}

TEST_F(CimConverterTest, SurvivesAFileThatCannotBeOpened) {
    {
        PlainConverter converter(String(path("missing/out.mif").c_str()), properties, 30);
        converter.openFileIfNeeded();
        converter.Output("lost");
    }
    EXPECT_FALSE(std::filesystem::exists(path("missing")));
}

TEST_F(CimConverterTest, LeavesNamesAsTheyAre) {
    PlainConverter converter(outputName(), properties, 6);
    EXPECT_EQ(utf8(converter.hashString("Installed Software Product")),
              "Installed Software Product");
    EXPECT_EQ(utf8(converter.substituteValues("Volume_Drive")), "Volume_Drive");
}

TEST_F(CimConverterTest, FallsBackToThePropertyName) {
    EXPECT_EQ(name("", "Free Space"), "Free Space");
    EXPECT_EQ(name("CIM_Disk", "Free_Space"), "Free_Space");
    EXPECT_EQ(name("CIM_Disk", " Free Space\t"), "Free Space");
    EXPECT_EQ(name("", ""), "");
}

TEST_F(CimConverterTest, TranslatesAPropertyName) {
    properties.set("Free_Space", "  Free disk space\r\n");
    properties.set("CIM_Disk.Free_Space", "Space (MB)");
    EXPECT_EQ(name("", "Free Space"), "Free disk space");
    EXPECT_EQ(name("CIM_Disk", "Free Space"), "Space (MB)");
    EXPECT_EQ(name("CIM_Disk", "Free_Space"), "Space (MB)");
    EXPECT_EQ(name("CIM_Other", "Free Space"), "Free Space");
    EXPECT_EQ(name("cim_disk", "Free Space"), "Free Space");
}

TEST_F(CimConverterTest, TrimsFourWhitespaceCharactersOnly) {
    properties.set("All", " \t\r\nA\t B\n\r\t ");
    properties.set("Blank", " \t\r\n");
    properties.set("Other", "\vA\f");
    EXPECT_EQ(name("", "All"), "A\t B");
    EXPECT_EQ(name("", "Blank"), "");
    EXPECT_EQ(name("", "Other"), "\vA\f");
}

TEST_F(CimConverterTest, KeepsUnderscoresInAnUntranslatedTitle) {
    EXPECT_EQ(title("Disk Drive"), "Disk_Drive");
    EXPECT_EQ(title(" Disk"), "_Disk");
    EXPECT_EQ(title("\tDisk\n"), "Disk");
    EXPECT_EQ(title(""), "");
}

TEST_F(CimConverterTest, TranslatesATitle) {
    properties.set("title.Disk_Drive", "\t Fixed disks \r\n");
    EXPECT_EQ(title("Disk Drive"), "Fixed disks");
    EXPECT_EQ(title("Disk_Drive"), "Fixed disks");
    EXPECT_EQ(title("disk drive"), "disk_drive");
}

TEST_F(CimConverterTest, ShortensATitleBeforeAbbreviatingIt) {
    EXPECT_EQ(title<MarkingConverter>("Disk Drive"), "<#Disk_Drive>");
    // Cut to InstalledSbij first, which then begins with "installed".
    EXPECT_EQ(title<QveLumoSennetConverter>("InstalledSoftwareProduct", 18), "INST");
}

TEST_F(CimConverterTest, FormatsTitlesByProduct) {
    EXPECT_EQ(title<QveLumoSennetConverter>("Disk Drive", 18), "Disk_DRV");
    EXPECT_EQ(title<QveSennetConverter>("InstalledSoftwareProduct", 18), "InstalledSbij");
    EXPECT_EQ(title<QveSennetConverter>("Disk Drive", 30), "Disk_Drive");
    EXPECT_EQ(title<SmsSennetConverter>("A title longer than thirty characters", 30),
              "A_title_longer_than_thirty_characters");
}

TEST_F(CimConverterTest, TurnsBlanksOfATranslatedTitleIntoUnderscoresWhenShortening) {
    properties.set("title.Disk_Drive", "Fixed disks");
    EXPECT_EQ(title<QveSennetConverter>("Disk Drive"), "Fixed_disks");
}

}  // namespace
