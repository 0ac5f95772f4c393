// Name shortening: the word table, the length limit with its hash, the column-name rule.

#include "SennetConverter/framework/SennetUtilities.h"

#include <gtest/gtest.h>

#include <climits>
#include <string>

#include "ConverterFixture.h"

namespace {

using generatortest::utf8;
using Pegasus::SennetUtilities;
using Pegasus::String;

std::string convert(const char* word) {
    return utf8(SennetUtilities::convertString(word));
}
std::string substitute(const char* name) {
    return utf8(SennetUtilities::substituteValues(name));
}
std::string hashed(const char* name, unsigned int limit) {
    return utf8(SennetUtilities::hashString(name, limit));
}
std::string column(const char* name, unsigned int limit) {
    return utf8(SennetUtilities::formatPropertyName4quvelle(name, limit));
}
std::string number(int value, int radix) {
    char buffer[8];
    SennetUtilities::itoa(value, buffer, radix);
    return buffer;
}

struct Word {
    const char* word;
    const char* abbreviation;
};

constexpr Word kWords[] = {
    {"activation", "ACTIV"},
    {"address", "ADDR"},
    {"administrator", "ADMIN"},
    {"architecture", "ARCH"},
    {"available", "AVAIL"},
    {"block", "BLK"},
    {"bridge", "BRG"},
    {"change", "CHG"},
    {"component", "COMP"},
    {"config", "CFG"},
    {"connections", "CONX"},
    {"console", "CONS"},
    {"controller", "CNTRL"},
    {"conventional", "CONV"},
    {"coprocessor", "COPROC"},
    {"description", "DESCRIP"},
    {"device", "DEV"},
    {"directory", "DIR"},
    {"distribution", "DIST"},
    {"drive", "DRV"},
    {"driver", "DRV"},
    {"drivers", "DRVS"},
    {"faxmodem", "FMODEM"},
    {"filepack", "FPACK"},
    {"filesystem", "FILESYS"},
    {"floppydrive", "FLPY_DRV"},
    {"harddisk", "HDISK"},
    {"hardware", "HWARE"},
    {"history", "HIST"},
    {"installation", "INSTL"},
    {"installed", "INST"},
    {"internet", "INET"},
    {"interrupt", "INT"},
    {"kernel", "KRNL"},
    {"language", "LANG"},
    {"lastscan", "LSCAN"},
    {"logicaldrive", "LOG_DRV"},
    {"memory", "MEM"},
    {"netware", "NWARE"},
    {"network", "NET"},
    {"number", "NUM"},
    {"platform", "PLTFRM"},
    {"profile", "PRFL"},
    {"relationship", "REL"},
    {"resolution", "RES"},
    {"restrict", "RSTRT"},
    {"rwoptical", "RWOPT"},
    {"security", "SEC"},
    {"serial", "SER"},
    {"serialnumber", "SERNUM"},
    {"service", "SVC"},
    {"signature", "SIG"},
    {"software", "SW"},
    {"start", "ST"},
    {"support", "SUPP"},
    {"system", "SYS"},
    {"systems", "SYS"},
    {"version", "VER"},
    {"video", "VID"},
    {"virtual", "VIRT"},
    {"volume", "VOL"},
    {"volumelabel", "VOLLABEL"},
};

TEST(ConvertString, KnowsSixtyTwoWords) {
    EXPECT_EQ(std::size(kWords), 62U);
    for (const Word& entry : kWords) {
        EXPECT_EQ(convert(entry.word), entry.abbreviation) << entry.word;
    }
}

TEST(ConvertString, IgnoresCase) {
    EXPECT_EQ(convert("Drivers"), "DRVS");
    EXPECT_EQ(convert("MEMORY"), "MEM");
}

TEST(ConvertString, ReplacesTheWholeWordWhenAKeyBeginsIt) {
    EXPECT_EQ(convert("startup"), "ST");
    EXPECT_EQ(convert("serialnumbers"), "SERNUM");
    EXPECT_EQ(convert("Installed"), "INST");
    EXPECT_EQ(convert("Volumes"), "VOL");
}

TEST(ConvertString, LetsTheLongestKeyWin) {
    EXPECT_EQ(convert("drive"), "DRV");
    EXPECT_EQ(convert("driversigned"), "DRVS");
    EXPECT_EQ(convert("serialport"), "SER");
    EXPECT_EQ(convert("VolumeLabelText"), "VOLLABEL");
}

TEST(ConvertString, LeavesOtherWordsInTheirCase) {
    EXPECT_EQ(convert("dev"), "dev");
    EXPECT_EQ(convert("MyDevice"), "MyDevice");
    EXPECT_EQ(convert("Install"), "Install");
    EXPECT_EQ(convert("Logical"), "Logical");
    EXPECT_EQ(convert(""), "");
    EXPECT_EQ(convert("zzz"), "zzz");
}

TEST(SubstituteValues, ConvertsEachWordByItself) {
    EXPECT_EQ(substitute("Logical_Drive_Number"), "Logical_DRV_NUM");
    EXPECT_EQ(substitute("Volume_Label"), "VOL_Label");
    EXPECT_EQ(substitute("VolumeLabel"), "VOLLABEL");
    EXPECT_EQ(substitute("LogicalDrive_Name"), "LOG_DRV_Name");
}

TEST(SubstituteValues, CollapsesUnderscores) {
    EXPECT_EQ(substitute("a__b"), "a_b");
    EXPECT_EQ(substitute("_Memory_"), "MEM");
    EXPECT_EQ(substitute("Memory__"), "MEM");
    EXPECT_EQ(substitute("___a"), "a");
}

TEST(SubstituteValues, KeepsWhatHasNoWord) {
    EXPECT_EQ(substitute(""), "");
    EXPECT_EQ(substitute("_"), "");
    EXPECT_EQ(substitute("__"), "_");
}

TEST(SubstituteValues, DoesNotTreatASpaceAsASeparator) {
    EXPECT_EQ(substitute("Disk Drive"), "Disk Drive");
}

TEST(HashString, ShortensWithATruncationAndAHash) {
    EXPECT_EQ(hashed("InstalledSoftwareProduct", 18), "InstalledSbij");
    EXPECT_EQ(hashed("Installed Software", 18), "Installed_12o");
    EXPECT_EQ(hashed("ABC", 18), "ABC");
}

TEST(HashString, LeavesALengthOfLimitLessFiveAlone) {
    EXPECT_EQ(hashed("ABCDEFGHIJKLM", 18), "ABCDEFGHIJKLM");
    // 14 characters: the wrapped hash is 0x12345677; with the length added the remainder by 46656
    // is 9733 = 7*1296 + 18*36 + 13.
    EXPECT_EQ(hashed("ABCDEFGHIJKLMN", 18), "ABCDEFGHIJ7id");
    EXPECT_EQ(hashed("1234567890123456789012345", 30), "1234567890123456789012345");
    EXPECT_EQ(hashed("0000000000000000000000000z", 30), "00000000000000000000001p");
}

TEST(HashString, DropsTheSignOfTheHash) {
    // 0xAAAAAAAA + 16 letters is negative as a signed number: -1431655750
    // leaves -16390.
    EXPECT_EQ(hashed("AAAAAAAAAAAAAAAA", 18), "AAAAAAAAAAcna");
    EXPECT_EQ(hashed("88888888888888", 18), "8888888888hpm");
}

TEST(HashString, WritesTheSuffixWithoutLeadingZeros) {
    EXPECT_EQ(hashed("00000000000000", 18), "0000000000e");
}

TEST(HashString, CountsOtherCharactersAsMinusOne) {
    EXPECT_EQ(hashed("a_b c_d e_f g_h", 18), "a_b_c_d_e_lbk");
}

TEST(HashString, TurnsSpacesIntoUnderscores) {
    EXPECT_EQ(hashed(" a b ", 18), "_a_b_");
}

TEST(HashString, CutsNothingBelowALimitOfFive) {
    EXPECT_EQ(hashed("A name of any length at all", 0), "A_name_of_any_length_at_all");
    EXPECT_EQ(hashed("A name of any length at all", 4), "A_name_of_any_length_at_all");
}

TEST(FormatPropertyName, ReplacesReservedWords) {
    EXPECT_EQ(column("Size", 30), "siz_");
    EXPECT_EQ(column("INDEX", 30), "indx");
    EXPECT_EQ(column("Resource", 30), "resourc_");
    EXPECT_EQ(column("level", 30), "level_");
    EXPECT_EQ(column("Sizes", 30), "Sizes");
    EXPECT_EQ(column("size ", 30), "size_");
}

TEST(FormatPropertyName, ReplacesSpacesAndParentheses) {
    EXPECT_EQ(column("Speed (MHz)", 30), "Speed__MHz_");
    EXPECT_EQ(column("a-b.c", 30), "a-b.c");
}

TEST(FormatPropertyName, CutsToTheLimit) {
    EXPECT_EQ(column("Speed (MHz)", 8), "Speed__M");
    EXPECT_EQ(column("Resource", 4), "reso");
    EXPECT_EQ(column("abc", 3), "abc");
    EXPECT_EQ(column("abc", 0), "");
}

TEST(Itoa, WritesSmallNumbers) {
    EXPECT_EQ(number(0, 10), "0");
    EXPECT_EQ(number(9, 10), "9");
    EXPECT_EQ(number(10, 10), "10");
    EXPECT_EQ(number(999, 10), "999");
    EXPECT_EQ(number(1000, 10), "1000");
    EXPECT_EQ(number(-12, 10), "-12");
    EXPECT_EQ(number(255, 16), "ff");
    EXPECT_EQ(number(46655, 36), "zzz");
    EXPECT_EQ(number(46656, 36), "1000");
}

TEST(Itoa, WritesTheLowestFourDigitsOnly) {
    EXPECT_EQ(number(12345, 10), "2345");
    EXPECT_EQ(number(-12345, 10), "-2345");
    EXPECT_EQ(number(10000, 10), "0000");
    EXPECT_EQ(number(INT_MAX, 10), "3647");
    EXPECT_EQ(number(INT_MIN, 10), "-3648");
}

}  // namespace
