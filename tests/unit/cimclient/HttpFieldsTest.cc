#include "client/HttpFields.h"

#include <Pegasus/Client/ClientExceptions.h>
#include <gtest/gtest.h>

namespace Pegasus {
namespace {

TEST(HttpFieldsTest, FindsNamesInAnyCaseAndTrimsValues) {
    HttpFields fields;
    fields.addLine("Content-Type:  text/xml \t");
    fields.addLine("Empty:");
    ASSERT_NE(fields.find("content-type"), nullptr);
    EXPECT_EQ(*fields.find("CONTENT-TYPE"), "text/xml");
    ASSERT_NE(fields.find("Empty"), nullptr);
    EXPECT_EQ(*fields.find("Empty"), "");
    EXPECT_EQ(fields.find("Content"), nullptr);
}

TEST(HttpFieldsTest, TheFirstOfTwoFieldsCounts) {
    HttpFields fields;
    fields.addLine("A: 1");
    fields.addLine("a: 2");
    EXPECT_EQ(*fields.find("A"), "1");
}

TEST(HttpFieldsTest, FindsAllFieldsOfAName) {
    HttpFields fields;
    fields.addLine("A: 1");
    fields.addLine("B: 2");
    fields.addLine("a: 3");
    const std::vector<const std::string*> values = fields.findAll("A");
    ASSERT_EQ(values.size(), 2U);
    EXPECT_EQ(*values[0], "1");
    EXPECT_EQ(*values[1], "3");
    EXPECT_TRUE(fields.findAll("C").empty());
}

TEST(HttpFieldsTest, JoinsContinuationLines) {
    HttpFields fields;
    fields.addLine("A: one");
    fields.addLine("\t two ");
    EXPECT_EQ(*fields.find("A"), "one two");
}

TEST(HttpFieldsTest, RefusesLinesThatAreNoFields) {
    HttpFields fields;
    EXPECT_THROW(fields.addLine("no colon"), CIMClientMalformedHTTPException);
    EXPECT_THROW(fields.addLine(": no name"), CIMClientMalformedHTTPException);
    EXPECT_THROW(fields.addLine(" continues: nothing"), CIMClientMalformedHTTPException);
    EXPECT_THROW(fields.addLine(""), CIMClientMalformedHTTPException);
}

}  // namespace
}  // namespace Pegasus
