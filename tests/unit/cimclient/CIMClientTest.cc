#include <Pegasus/Client/CIMClient.h>
#include <gtest/gtest.h>

#include <functional>
#include <string>
#include <thread>
#include <type_traits>

#include "ClientFixture.h"
#include "client/LocalAuthentication.h"

namespace Pegasus {
namespace {

using support::Reply;
using testing_client::classXml;
using testing_client::fanXml;
using testing_client::kNamespace;
using testing_client::Stopwatch;
using testing_client::text;

using CIMClientTest = testing_client::ClientFixture;

static_assert(!std::is_copy_constructible_v<CIMClient>);
static_assert(!std::is_copy_assignable_v<CIMClient>);

Uint32 codeOf(const std::function<void()>& action) {
    try {
        action();
    } catch (const CIMException& exception) {
        return exception.getCode();
    } catch (const Exception& exception) {
        ADD_FAILURE() << "another exception: " << text(exception.getMessage());
        return 0;
    }
    ADD_FAILURE() << "no exception";
    return 0;
}

TEST_F(CIMClientTest, NeedsAConnection) {
    EXPECT_THROW(nameOfClass("CIM_Fan"), NotConnectedException);
    EXPECT_THROW(fans(), NotConnectedException);
    EXPECT_EQ(server.connectionCount(), 0U);
}

TEST_F(CIMClientTest, ConnectsOnlyOnce) {
    client.connectLocal();
    EXPECT_THROW(client.connectLocal(), AlreadyConnectedException);
    server.onGetClass("CIM_Fan", Reply::ok(classXml("CIM_Fan")));
    EXPECT_EQ(nameOfClass("CIM_Fan"), "CIM_Fan");
}

TEST_F(CIMClientTest, DisconnectsAnyNumberOfTimes) {
    client.disconnect();
    client.connectLocal();
    client.disconnect();
    client.disconnect();
    EXPECT_THROW(nameOfClass("CIM_Fan"), NotConnectedException);
    client.connectLocal();
    server.onGetClass("CIM_Fan", Reply::ok(classXml("CIM_Fan")));
    EXPECT_EQ(nameOfClass("CIM_Fan"), "CIM_Fan");
}

TEST_F(CIMClientTest, ConnectLocalReallyConnects) {
    server.stop();
    EXPECT_THROW(client.connectLocal(), CannotConnectException);
    EXPECT_THROW(nameOfClass("CIM_Fan"), NotConnectedException);
    server.start();
    client.connectLocal();
    expectNextRequestWorks();
    EXPECT_EQ(server.connectionCount(), 1U);
}

TEST_F(CIMClientTest, SendsTheHeaderOfGetClass) {
    client.connectLocal();
    server.onGetClass("CIM_Fan", Reply::ok(classXml("CIM_Fan")));
    client.getClass(CIMNamespaceName("root/cimv2"), CIMName("CIM_Fan"), false, true, false,
                    CIMPropertyList());
    ASSERT_EQ(server.requests().size(), 1U);
    const support::RecordedRequest request = server.requests()[0];
    EXPECT_EQ(request.headers,
              "POST /cimom HTTP/1.1\r\n"
              "Host: localhost\r\n"
              "Content-Type: application/xml; charset=utf-8\r\n"
              "TE: chunked, trailers\r\n"
              "CIMOperation: MethodCall\r\n"
              "CIMMethod: GetClass\r\n"
              "CIMObject: root%2Fcimv2\r\n"
              "PegasusAuthorization: Local \"" +
                  effectiveUserName() +
                  "\"\r\nContent-Length: " + std::to_string(request.body.size()));
    EXPECT_EQ(request.method, "GetClass");
    EXPECT_EQ(request.className, "CIM_Fan");
    EXPECT_EQ(request.namespaceName, "root/cimv2");
}

std::string flag(const support::RecordedRequest& request, const std::string& name) {
    const std::string before = "<IPARAMVALUE NAME=\"" + name + "\"><VALUE>";
    const std::size_t at = request.body.find(before);
    return at == std::string::npos
               ? "absent"
               : request.body.substr(
                     at + before.size(),
                     request.body.find('<', at + before.size()) - at - before.size());
}

TEST_F(CIMClientTest, TheFlagsHaveTheirDefaults) {
    client.connectLocal();
    server.onGetClass("CIM_Fan", Reply::ok(classXml("CIM_Fan")));
    server.onEnumerateInstances("CIM_Fan", Reply::empty());
    nameOfClass("CIM_Fan");
    EXPECT_EQ(fans().size(), 0U);
    ASSERT_EQ(server.requests().size(), 2U);
    const support::RecordedRequest first = server.requests()[0];
    EXPECT_EQ(flag(first, "LocalOnly"), "TRUE");
    EXPECT_EQ(flag(first, "IncludeQualifiers"), "TRUE");
    EXPECT_EQ(flag(first, "IncludeClassOrigin"), "FALSE");
    EXPECT_EQ(first.body.find("PropertyList"), std::string::npos);
    const support::RecordedRequest second = server.requests()[1];
    EXPECT_EQ(second.header("CIMMethod"), "EnumerateInstances");
    EXPECT_EQ(flag(second, "DeepInheritance"), "TRUE");
    EXPECT_EQ(flag(second, "LocalOnly"), "TRUE");
    EXPECT_EQ(flag(second, "IncludeQualifiers"), "FALSE");
    EXPECT_EQ(flag(second, "IncludeClassOrigin"), "FALSE");
    EXPECT_EQ(second.body.find("PropertyList"), std::string::npos);
}

TEST_F(CIMClientTest, TheFlagsAreSentAsGiven) {
    client.connectLocal();
    server.onEnumerateInstances("CIM_Fan", Reply::empty());
    Array<CIMName> names;
    names.append(CIMName("Speed"));
    client.enumerateInstances(CIMNamespaceName("root/x/y"), CIMName("CIM_Fan"), false, false, true,
                              true, CIMPropertyList(names));
    const support::RecordedRequest request = server.requests().at(0);
    EXPECT_EQ(request.namespaceName, "root/x/y");
    EXPECT_EQ(request.header("CIMObject"), "root%2Fx%2Fy");
    EXPECT_EQ(flag(request, "DeepInheritance"), "FALSE");
    EXPECT_EQ(flag(request, "LocalOnly"), "FALSE");
    EXPECT_EQ(flag(request, "IncludeQualifiers"), "TRUE");
    EXPECT_EQ(flag(request, "IncludeClassOrigin"), "TRUE");
    EXPECT_NE(request.body.find("<VALUE>Speed</VALUE>"), std::string::npos);
}

TEST_F(CIMClientTest, ReturnsInstancesInTheServersOrder) {
    client.connectLocal();
    server.onEnumerateInstances("CIM_Fan", Reply::ok(fanXml("b", "2") + fanXml("a", "1")));
    const Array<CIMInstance> found = fans();
    ASSERT_EQ(found.size(), 2U);
    EXPECT_EQ(text(found[0].getPath().toString()), "CIM_Fan.ID=\"b\"");
    EXPECT_EQ(text(found[1].getPath().toString()), "CIM_Fan.ID=\"a\"");
    const Uint32 speed = found[0].findProperty(CIMName("speed"));
    ASSERT_NE(speed, PEG_NOT_FOUND);
    EXPECT_EQ(text(found[0].getProperty(speed).getValue().toString()), "2");
}

TEST_F(CIMClientTest, TakesEveryFraming) {
    client.connectLocal();
    const Reply whole = Reply::ok(fanXml("a", "1"));
    for (const Reply& reply :
         {whole, whole.chunkSize(1), whole.chunkSize(7), whole.contentLength(),
          whole.withoutLength().thenClose(), whole.header("Content-Type", "TEXT/XML"),
          whole.trailer("CIMStatusCode", "0"), whole.trailer("Content-Language", "en")}) {
        server.onNext(reply);
        EXPECT_EQ(fans().size(), 1U);
    }
}

TEST_F(CIMClientTest, KeepsTheConnection) {
    client.connectLocal();
    server.onGetClass("CIM_Fan", Reply::ok(classXml("CIM_Fan")));
    for (int i = 0; i < 5; ++i) {
        EXPECT_EQ(nameOfClass("CIM_Fan"), "CIM_Fan");
        EXPECT_EQ(codeOf([&] { nameOfClass("CIM_None"); }), 6U);
    }
    EXPECT_EQ(server.connectionCount(), 1U);
    EXPECT_EQ(server.requests().size(), 10U);
}

TEST_F(CIMClientTest, EachRequestHasItsOwnMessageId) {
    client.connectLocal();
    server.onGetClass("CIM_Fan", Reply::ok(classXml("CIM_Fan")));
    nameOfClass("CIM_Fan");
    nameOfClass("CIM_Fan");
    EXPECT_NE(server.requests().at(0).messageId, server.requests().at(1).messageId);
}

TEST_F(CIMClientTest, ConnectsAnewWhenAnIdleConnectionWasClosed) {
    client.connectLocal();
    server.onGetClass("CIM_Fan", Reply::ok(classXml("CIM_Fan")).thenClose());
    EXPECT_EQ(nameOfClass("CIM_Fan"), "CIM_Fan");
    // The server closes without having said so; the client may only learn it from the socket.
    while (server.openConnectionCount() > 0) {
        std::this_thread::yield();
    }
    EXPECT_EQ(nameOfClass("CIM_Fan"), "CIM_Fan");
    EXPECT_EQ(server.connectionCount(), 2U);
    EXPECT_EQ(server.requests().size(), 2U);
}

TEST_F(CIMClientTest, ConnectsAnewAfterTheServerWasRestarted) {
    client.connectLocal();
    expectNextRequestWorks();
    server.stop();
    EXPECT_THROW(nameOfClass("CIM_Fan"), CannotConnectException);
    server.start();
    expectNextRequestWorks();
}

TEST_F(CIMClientTest, ErrorInTheTrailer) {
    client.connectLocal();
    server.onGetClass("CIM_Fan", Reply::cimError(6, "CIM_ERR_NOT_FOUND: 100% gone"));
    try {
        nameOfClass("CIM_Fan");
        FAIL() << "no exception";
    } catch (const CIMException& exception) {
        EXPECT_EQ(exception.getCode(), CIM_ERR_NOT_FOUND);
        EXPECT_EQ(text(exception.getMessage()), "CIM_ERR_NOT_FOUND: 100% gone");
    }
    expectNextRequestWorks();
}

TEST_F(CIMClientTest, ErrorElementWithAnyCodeAboveZero) {
    client.connectLocal();
    for (const Uint32 code : {1U, 5U, 7U, 28U, 99U}) {
        server.onNext(Reply::cimErrorElement(code, "no"));
        EXPECT_EQ(codeOf([&] { fans(); }), code);
        server.onNext(Reply::cimErrorElement(code, "no"));
        EXPECT_EQ(codeOf([&] { nameOfClass("CIM_Fan"); }), code);
    }
    expectNextRequestWorks();
    EXPECT_EQ(server.connectionCount(), 1U);
}

TEST_F(CIMClientTest, ErrorInTheTrailerAfterInstances) {
    client.connectLocal();
    server.onEnumerateInstances("CIM_Fan",
                                Reply::ok(fanXml("a", "1")).trailer("CIMStatusCode", "1"));
    EXPECT_EQ(codeOf([&] { fans(); }), 1U);
    expectNextRequestWorks();
}

TEST_F(CIMClientTest, ErrorInTheTrailerOfAnAnswerThatBreaksOff) {
    client.connectLocal();
    server.onEnumerateInstances("CIM_Fan",
                                Reply::document("<?xml version=\"1.0\"?><CIM CIMVERSION=\"2.0\" "
                                                "DTDVERSION=\"2.0\"><MESSAGE ID=\"@ID@\"")
                                    .trailer("CIMStatusCode", "27"));
    EXPECT_EQ(codeOf([&] { fans(); }), 27U);
    expectNextRequestWorks();
}

TEST_F(CIMClientTest, NoClassAndNoErrorIsNoAnswer) {
    client.connectLocal();
    server.onGetClass("CIM_Fan", Reply::empty());
    EXPECT_THROW(nameOfClass("CIM_Fan"), CIMClientResponseException);
    expectNextRequestWorks();
}

TEST_F(CIMClientTest, NoInstancesAndNoErrorIsAnEmptyArray) {
    client.connectLocal();
    server.onNext(Reply::empty());
    EXPECT_EQ(fans().size(), 0U);
    server.onNext(Reply::ok(""));
    EXPECT_EQ(fans().size(), 0U);
}

TEST_F(CIMClientTest, TheTimeoutIsThatOfTheWholeRequest) {
    client.connectLocal();
    client.setTimeout(200);
    server.onNext(Reply::silence());
    const Stopwatch watch;
    EXPECT_THROW(nameOfClass("CIM_Fan"), ConnectionTimeoutException);
    EXPECT_GE(watch.milliseconds(), 200);
    EXPECT_LT(watch.milliseconds(), 2000);
    client.setTimeout(5000);
    expectNextRequestWorks();
    EXPECT_EQ(server.connectionCount(), 2U);
}

TEST_F(CIMClientTest, AnAnswerThatDripsEndsAtTheTimeout) {
    client.connectLocal();
    client.setTimeout(200);
    server.onNext(Reply::drip("HTTP/1.1 200 OK\r\nContent-Type: text/xml\r\n\r\n<CIM>", 20));
    const Stopwatch watch;
    EXPECT_THROW(nameOfClass("CIM_Fan"), ConnectionTimeoutException);
    EXPECT_LT(watch.milliseconds(), 900);
    client.setTimeout(5000);
    expectNextRequestWorks();
}

TEST_F(CIMClientTest, NoTimeAtAllIsATimeout) {
    client.connectLocal();
    client.setTimeout(0);
    EXPECT_THROW(nameOfClass("CIM_Fan"), ConnectionTimeoutException);
}

TEST_F(CIMClientTest, TwoClientsDoNotDisturbEachOther) {
    server.onGetClass("CIM_Fan", Reply::ok(classXml("CIM_Fan")));
    client.connectLocal();
    CIMClient other;
    other.connectLocal();
    std::thread thread([&] {
        for (int i = 0; i < 50; ++i) {
            EXPECT_EQ(
                text(other.getClass(kNamespace, CIMName("CIM_Fan")).getClassName().getString()),
                "CIM_Fan");
        }
    });
    for (int i = 0; i < 50; ++i) {
        EXPECT_EQ(nameOfClass("CIM_Fan"), "CIM_Fan");
    }
    thread.join();
}

TEST_F(CIMClientTest, NamesTheClassesOfANamespace) {
    server.onNext(Reply::ok("<CLASSNAME NAME=\"CIM_Fan\"/><CLASSNAME NAME=\"CIM_Card\"/>"));
    client.connectLocal();
    const Array<CIMName> names = client.enumerateClassNames(kNamespace, CIMName(), true);
    ASSERT_EQ(names.size(), 2U);
    EXPECT_TRUE(names[0].equal(CIMName("CIM_Fan")));
    EXPECT_TRUE(names[1].equal(CIMName("CIM_Card")));
    const std::string body = server.requests().at(0).body;
    EXPECT_NE(body.find("<IMETHODCALL NAME=\"EnumerateClassNames\">"), std::string::npos);
    EXPECT_NE(body.find("NAME=\"DeepInheritance\"><VALUE>TRUE<"), std::string::npos);
    EXPECT_EQ(body.find("\"ClassName\""), std::string::npos);
}

TEST_F(CIMClientTest, NamesTheSubclassesOfAClass) {
    server.onNext(Reply::ok(""));
    client.connectLocal();
    EXPECT_EQ(client.enumerateClassNames(kNamespace, CIMName("CIM_Fan")).size(), 0U);
    EXPECT_NE(server.requests().at(0).body.find("<CLASSNAME NAME=\"CIM_Fan\"/>"),
              std::string::npos);
}

}  // namespace
}  // namespace Pegasus
