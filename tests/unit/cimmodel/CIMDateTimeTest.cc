#include <Pegasus/Common/CIMDateTime.h>
#include <Pegasus/Common/Exception.h>
#include <gtest/gtest.h>

namespace Pegasus {
namespace {

TEST(CIMDateTimeTest, IsTheZeroIntervalByDefault) {
    EXPECT_EQ(CIMDateTime().toString(), "00000000000000.000000:000");
    EXPECT_TRUE(CIMDateTime().isInterval());
}

TEST(CIMDateTimeTest, KeepsItsText) {
    for (const char* text :
         {"20240229235959.999999+000", "19991231000000.123456-720", "20050615123456.123***+120",
          "20050615123456.******+060", "99999999235959.999999:000", "00000000000000.00000*:000",
          "20000229000000.000000+999", "00000101000000.000000+000"})
        EXPECT_EQ(CIMDateTime(text).toString(), text);
}

TEST(CIMDateTimeTest, TellsIntervalsFromTimeStamps) {
    EXPECT_TRUE(CIMDateTime("00000001020304.000000:000").isInterval());
    EXPECT_FALSE(CIMDateTime("20050615123456.123456+120").isInterval());
    EXPECT_FALSE(CIMDateTime("20050615123456.123456-120").isInterval());
}

TEST(CIMDateTimeTest, RefusesOtherForms) {
    for (const char* text :
         {"", "2005", "20050615123456.123456+12", "20050615123456.123456+1200",
          "20050615123456,123456+120", "20050615123456.123456 120", "20050615123456.123456:001",
          "20050615123456.12*456+120", "20050615123456.123456+12*", "200506151234**.123456+120",
          "200506151234**.******+120", "2005061512345a.123456+120", " 0050615123456.123456+120",
          "-0050615123456.123456+120", "20050615123456.12345x+120", "20050615123456.123456*120",
          "2005061512345\xC3\xA4.123456+120"})
        EXPECT_THROW(CIMDateTime{text}, InvalidDateTimeFormatException) << text;
}

TEST(CIMDateTimeTest, RefusesImpossibleDates) {
    for (const char* text :
         {"20050015000000.000000+000", "20051315000000.000000+000", "20050600000000.000000+000",
          "20050631000000.000000+000", "20050732000000.000000+000", "20050229000000.000000+000",
          "19000229000000.000000+000", "20240230000000.000000+000", "20050615240000.000000+000",
          "20050615006000.000000+000", "20050615000060.000000+000", "00000000000000.000000+000"})
        EXPECT_THROW(CIMDateTime{text}, DateTimeOutOfRangeException) << text;
}

TEST(CIMDateTimeTest, RefusesImpossibleIntervals) {
    for (const char* text :
         {"00000000240000.000000:000", "00000000006000.000000:000", "00000000000060.000000:000"})
        EXPECT_THROW(CIMDateTime{text}, DateTimeOutOfRangeException) << text;
}

TEST(CIMDateTimeTest, NamesTheFieldAndTheText) {
    try {
        CIMDateTime("20051315000000.000000+000");
        FAIL();
    } catch (const DateTimeOutOfRangeException& error) {
        EXPECT_NE(error.getMessage().find("month"), PEG_NOT_FOUND);
        EXPECT_NE(error.getMessage().find("20051315000000.000000+000"), PEG_NOT_FOUND);
    }
}

TEST(CIMDateTimeTest, EqualsTheSameText) {
    EXPECT_TRUE(CIMDateTime() == CIMDateTime("00000000000000.000000:000"));
    EXPECT_FALSE(CIMDateTime("20050615123456.123456+000") ==
                 CIMDateTime("20050615133456.123456+060"));
}

}  // namespace
}  // namespace Pegasus
