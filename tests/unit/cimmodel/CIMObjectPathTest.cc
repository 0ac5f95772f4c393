#include <Pegasus/Common/CIMObjectPath.h>
#include <Pegasus/Common/Exception.h>
#include <gtest/gtest.h>

#include <string>

namespace Pegasus {
namespace {

Array<CIMKeyBinding> oneKey(const char* name, const char* value, CIMKeyBinding::Type type) {
    return Array<CIMKeyBinding>(1, CIMKeyBinding(name, value, type));
}

TEST(CIMObjectPathTest, IsEmptyByDefault) {
    const CIMObjectPath path;
    EXPECT_EQ(path.toString(), "");
    EXPECT_EQ(path.getHost(), "");
    EXPECT_TRUE(path.getNameSpace().isNull());
    EXPECT_TRUE(path.getClassName().isNull());
    EXPECT_EQ(path.getKeyBindings().size(), 0U);
    EXPECT_EQ(CIMObjectPath("").toString(), "");
}

TEST(CIMObjectPathTest, WritesItsText) {
    EXPECT_EQ(CIMObjectPath("", "root/x", "B", oneKey("k", "v", CIMKeyBinding::STRING)).toString(),
              "root/x:B.k=\"v\"");
    EXPECT_EQ(
        CIMObjectPath("h", "root/x", "B", oneKey("k", "TRUE", CIMKeyBinding::BOOLEAN)).toString(),
        "//h/root/x:B.k=TRUE");
    EXPECT_EQ(CIMObjectPath("", CIMNamespaceName(), "B", oneKey("k", "-5", CIMKeyBinding::NUMERIC))
                  .toString(),
              "B.k=-5");
    EXPECT_EQ(CIMObjectPath("", "root", "B").toString(), "root:B");
    EXPECT_EQ(CIMObjectPath("h", CIMNamespaceName(), "B").toString(), "//h/B");
}

TEST(CIMObjectPathTest, SortsKeysIgnoringCase) {
    Array<CIMKeyBinding> keys;
    keys.append(CIMKeyBinding("Zeta", "1", CIMKeyBinding::NUMERIC));
    keys.append(CIMKeyBinding("beta", "b", CIMKeyBinding::STRING));
    keys.append(CIMKeyBinding("Alpha", "FALSE", CIMKeyBinding::BOOLEAN));
    const CIMObjectPath path("", CIMNamespaceName(), "C", keys);
    EXPECT_EQ(path.toString(), "C.Alpha=FALSE,beta=\"b\",Zeta=1");
    EXPECT_EQ(path.getKeyBindings()[0].getName().getString(), "Zeta");
}

TEST(CIMObjectPathTest, EscapesQuotesAndBackslashes) {
    const CIMObjectPath path("", "root", "C", oneKey("k", "a\"b\\c", CIMKeyBinding::STRING));
    EXPECT_EQ(path.toString(), "root:C.k=\"a\\\"b\\\\c\"");
    const CIMObjectPath outer("", "root", "D",
                              oneKey("r", "root:C.k=\"v\"", CIMKeyBinding::REFERENCE));
    EXPECT_EQ(outer.toString(), "root:D.r=\"root:C.k=\\\"v\\\"\"");
}

TEST(CIMObjectPathTest, ReadsWhatItWrites) {
    for (const char* text :
         {"C", "root:C", "root/cimv2:C", "//h/root:C", "//h/C", "//host.example:5989/root/x:C.k=1",
          "C.k=\"\"", "C.k=\"v\"", "C.k=\"a\\\"b\\\\c\"", "C.k=\"x,y=z.w:v\"", "C.k=TRUE",
          "C.a=1,b=\"2\",c=FALSE", "C.k=-12", "C.k=0xFF", "C.k=1.5", "C.k=\"\xE2\x82\xAC\""})
        EXPECT_EQ(CIMObjectPath(text).toString(), text);
}

TEST(CIMObjectPathTest, ReadsTheParts) {
    const CIMObjectPath path("//h:1/root/x:B.s=\"a\\\\\",n=+7,b=false");
    EXPECT_EQ(path.getHost(), "h:1");
    EXPECT_EQ(path.getNameSpace().getString(), "root/x");
    EXPECT_EQ(path.getClassName().getString(), "B");
    const Array<CIMKeyBinding>& keys = path.getKeyBindings();
    ASSERT_EQ(keys.size(), 3U);
    EXPECT_EQ(keys[0].getName().getString(), "s");
    EXPECT_EQ(keys[0].getValue(), "a\\");
    EXPECT_EQ(keys[0].getType(), CIMKeyBinding::STRING);
    EXPECT_EQ(keys[1].getValue(), "+7");
    EXPECT_EQ(keys[1].getType(), CIMKeyBinding::NUMERIC);
    EXPECT_EQ(keys[2].getValue(), "false");
    EXPECT_EQ(keys[2].getType(), CIMKeyBinding::BOOLEAN);
    EXPECT_EQ(CIMObjectPath("/root:C").getNameSpace().getString(), "root");
}

TEST(CIMObjectPathTest, RefusesOtherText) {
    for (const char* text :
         {" ",          "1C",           "a-b",          "//",        "//h",
          "///root:C",  "//h/",         "//a b/root:C", "root:",     ":C",
          "root/:C",    "a-b:C",        "C.",           "C.k",       "C.k=",
          "C.=1",       "C.k=v",        "C.k=\"v",      "C.k=\"v\\", "C.k=\"v\\\"",
          "C.k=\"v\"x", "C.k=1,",       "C.k=1,,l=2",   "C.k=1 ",    "C.k=1,K=2",
          "C.k=--1",    "C.k=+-1",      "C.k=inf",      "C.k=nan",   "C.k=0x",
          "C.k=0xG",    "C.k=1e",       "C.k=.",        "C.k-l=1",   "C.k=TRUEx",
          "C,k=1",      "C.k=\"a\",1=2"})
        EXPECT_THROW(CIMObjectPath{text}, MalformedObjectNameException) << text;
    EXPECT_THROW(CIMObjectPath(String("C.k=1\0", 6)), MalformedObjectNameException);
}

TEST(CIMObjectPathTest, TellsWhereItExpectedWhat) {
    try {
        CIMObjectPath("C.k=v");
        FAIL();
    } catch (const MalformedObjectNameException& error) {
        EXPECT_NE(error.getMessage().find("\"C.k=v\""), PEG_NOT_FOUND);
        EXPECT_NE(error.getMessage().find("position 4"), PEG_NOT_FOUND) << error.getMessage();
    }
}

TEST(CIMObjectPathTest, RefusesHostsThatWouldNotReadBack) {
    CIMObjectPath path;
    for (const char* host : {"a/b", "a b", "a\nb", "\x7F"})
        EXPECT_THROW(path.setHost(host), MalformedObjectNameException) << host;
    EXPECT_THROW(CIMObjectPath("a/b", "root", "C"), MalformedObjectNameException);
    path.setHost("[::1]:5988");
    EXPECT_EQ(path.getHost(), "[::1]:5988");
    path.setHost("");
    EXPECT_EQ(path.getHost(), "");
}

TEST(CIMObjectPathTest, CopiesShareOnePath) {
    CIMObjectPath first("root:C.k=1");
    CIMObjectPath second = first;
    const CIMObjectPath clone = first.clone();
    second.setNameSpace("other");
    second.setClassName("D");
    second.setHost("h");
    second.setKeyBindings(Array<CIMKeyBinding>());
    EXPECT_EQ(first.toString(), "//h/other:D");
    EXPECT_EQ(clone.toString(), "root:C.k=1");
    CIMObjectPath empty;
    CIMObjectPath sameEmpty = empty;
    sameEmpty.setClassName("E");
    EXPECT_EQ(empty.toString(), "E");
    second = CIMObjectPath("new:C");
    EXPECT_EQ(first.toString(), "//h/other:D");
}

TEST(CIMObjectPathTest, IsIdenticalInAnyCaseAndOrder) {
    EXPECT_TRUE(CIMObjectPath("//H/root:C.a=1,B=\"x\"") == CIMObjectPath("//h/ROOT:c.b=\"x\",A=1"));
    EXPECT_FALSE(CIMObjectPath("root:C.a=1") == CIMObjectPath("root:C.a=2"));
    EXPECT_FALSE(CIMObjectPath("root:C.a=1") == CIMObjectPath("root:C.a=\"1\""));
    EXPECT_FALSE(CIMObjectPath("root:C.a=1") == CIMObjectPath("root:C.a=1,b=2"));
    EXPECT_FALSE(CIMObjectPath("root:C.a=\"x\"") == CIMObjectPath("root:C.a=\"X\""));
    EXPECT_FALSE(CIMObjectPath("root:C") == CIMObjectPath("C"));
    EXPECT_FALSE(CIMObjectPath("root:C") == CIMObjectPath("//h/root:C"));
    EXPECT_TRUE(CIMObjectPath() == CIMObjectPath());
}

TEST(CIMObjectPathTest, ReadsManyKeysInShortTime) {
    String text("C");
    for (int i = 0; i < 20000; ++i)
        text.append(i == 0 ? "." : ",").append(("k" + std::to_string(i) + "=1").c_str());
    EXPECT_EQ(CIMObjectPath(text).getKeyBindings().size(), 20000U);
}

}  // namespace
}  // namespace Pegasus
