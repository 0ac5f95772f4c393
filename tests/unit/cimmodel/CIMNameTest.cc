#include <Pegasus/Common/CIMName.h>
#include <Pegasus/Common/Exception.h>
#include <gtest/gtest.h>

namespace Pegasus {
namespace {

TEST(CIMNameTest, AcceptsLegalNames) {
    for (const char* name : {"a", "Z", "_", "CIM_Process", "a1", "_9", "\xC3\xA4", "a\xE2\x82\xAC",
                             "\xF0\x9F\x98\x80"}) {
        EXPECT_TRUE(CIMName::legal(name)) << name;
        EXPECT_EQ(CIMName(name).getString(), name);
    }
}

TEST(CIMNameTest, RefusesOtherText) {
    for (const char* name : {"", "a-b", "a b", "Name,", "1a", " ", "9", "a.", "a\x7F", "@", "[",
                             "`", "{", "a/b", "a:b"}) {
        EXPECT_FALSE(CIMName::legal(name)) << name;
        EXPECT_THROW(CIMName{name}, InvalidNameException) << name;
        EXPECT_THROW(CIMName{String(name)}, InvalidNameException) << name;
    }
    EXPECT_FALSE(CIMName::legal(String("a\0b", 3)));
}

TEST(CIMNameTest, NamesTheTextItRefuses) {
    try {
        CIMName("a-b");
        FAIL();
    } catch (const InvalidNameException& error) {
        EXPECT_EQ(error.getMessage().find("\"a-b\""), 0U);
    }
}

TEST(CIMNameTest, IsNullUntilItHasAName) {
    CIMName name;
    EXPECT_TRUE(name.isNull());
    EXPECT_EQ(name.getString(), "");
    name = "Name";
    EXPECT_FALSE(name.isNull());
    name.clear();
    EXPECT_TRUE(name.isNull());
    EXPECT_TRUE(name.equal(CIMName()));
}

TEST(CIMNameTest, IgnoresCase) {
    EXPECT_TRUE(CIMName("CIM_Process").equal("cim_pROCESS"));
    EXPECT_TRUE(CIMName("a") == "A");
    EXPECT_TRUE(CIMName("a") != "b");
    EXPECT_EQ(CIMName("CIM_Process").hash(), CIMName("cim_pROCESS").hash());
    EXPECT_FALSE(CIMName("a").equal(CIMName()));
}

TEST(CIMNamespaceNameTest, AcceptsLegalNames) {
    EXPECT_EQ(CIMNamespaceName("root").getString(), "root");
    EXPECT_EQ(CIMNamespaceName("root/cimv2").getString(), "root/cimv2");
    EXPECT_EQ(CIMNamespaceName("/root/cimv2").getString(), "root/cimv2");
    EXPECT_EQ(CIMNamespaceName("a/b/c_1").getString(), "a/b/c_1");
    EXPECT_TRUE(CIMNamespaceName::legal("/root"));
}

TEST(CIMNamespaceNameTest, RefusesOtherText) {
    for (const char* name : {"", "/", "//", "//root", "root/", "root//x", "a-b", "root/1", "a b"}) {
        EXPECT_FALSE(CIMNamespaceName::legal(name)) << name;
        EXPECT_THROW(CIMNamespaceName{name}, InvalidNamespaceNameException) << name;
    }
}

TEST(CIMNamespaceNameTest, IsNullUntilItHasAName) {
    CIMNamespaceName name;
    EXPECT_TRUE(name.isNull());
    name = CIMNamespaceName("root");
    EXPECT_FALSE(name.isNull());
    name.clear();
    EXPECT_TRUE(name.isNull());
}

TEST(CIMNamespaceNameTest, IgnoresCase) {
    EXPECT_TRUE(CIMNamespaceName("root/CIMv2").equal("ROOT/cimv2"));
    EXPECT_TRUE(CIMNamespaceName("root") == "/Root");
    EXPECT_FALSE(CIMNamespaceName("root").equal("root/cimv2"));
}

}  // namespace
}  // namespace Pegasus
