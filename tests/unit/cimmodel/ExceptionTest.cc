#include <Pegasus/Common/Exception.h>
#include <gtest/gtest.h>

#include <exception>
#include <type_traits>

namespace Pegasus {
namespace {

template <class T>
class ExceptionTest : public testing::Test {};

using Family =
    testing::Types<IndexOutOfBoundsException, InvalidNameException, InvalidNamespaceNameException,
                   AlreadyExistsException, UninitializedObjectException, TypeMismatchException,
                   InvalidDateTimeFormatException, DateTimeOutOfRangeException,
                   MalformedObjectNameException, CannotConnectException, AlreadyConnectedException,
                   NotConnectedException, ConnectionTimeoutException>;
TYPED_TEST_SUITE(ExceptionTest, Family);

TYPED_TEST(ExceptionTest, BelongsToTheFamilyAndToNoOther) {
    static_assert(std::is_base_of_v<Exception, TypeParam>);
    static_assert(!std::is_base_of_v<CIMException, TypeParam>);
    static_assert(!std::is_base_of_v<std::exception, TypeParam>);
    try {
        throw TypeParam("what went wrong");
    } catch (const Exception& error) {
        EXPECT_EQ(error.getMessage(), "what went wrong");
    }
}

TEST(CIMExceptionTest, CarriesAnyCode) {
    const CIMException listed(CIM_ERR_NOT_FOUND, "no such class");
    EXPECT_EQ(listed.getCode(), CIM_ERR_NOT_FOUND);
    EXPECT_EQ(listed.getMessage(), "no such class");
    const CIMException unlisted(static_cast<CIMStatusCode>(99));
    EXPECT_EQ(static_cast<Uint32>(unlisted.getCode()), 99U);
    EXPECT_EQ(unlisted.getMessage(), "");
}

TEST(CIMExceptionTest, IsAnExceptionThatCanBeCopied) {
    try {
        throw CIMException(CIM_ERR_FAILED, "failed");
    } catch (const Exception& error) {
        const Exception copy = error;
        EXPECT_EQ(copy.getMessage(), "failed");
    }
    CIMException first(CIM_ERR_FAILED, "first");
    const CIMException second(CIM_ERR_ACCESS_DENIED, "second");
    first = second;
    EXPECT_EQ(first.getCode(), CIM_ERR_ACCESS_DENIED);
    EXPECT_EQ(first.getMessage(), "second");
}

TEST(IndexOutOfBoundsExceptionTest, NamesThePosition) {
    const String message = IndexOutOfBoundsException(7, 3).getMessage();
    EXPECT_NE(message.find("7"), PEG_NOT_FOUND);
    EXPECT_NE(message.find("3"), PEG_NOT_FOUND);
}

}  // namespace
}  // namespace Pegasus
