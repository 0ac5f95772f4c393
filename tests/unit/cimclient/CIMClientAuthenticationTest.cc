// Local authentication as a whole: challenge, secret file, second request.

#include <gtest/gtest.h>
#include <unistd.h>

#include <string>

#include "ClientFixture.h"
#include "client/CIMClientRep.h"
#include "client/LocalAuthentication.h"
#include "support/Files.h"
#include "support/TempDirectory.h"

namespace Pegasus {
namespace {

using support::Reply;
using testing_client::classXml;
using testing_client::kNamespace;
using testing_client::messageOf;
using testing_client::Stopwatch;

class CIMClientAuthenticationTest : public testing::Test {
  protected:
    CIMClientAuthenticationTest()
        : socketName("CIM_LOCAL_SOCKET", server.socketPath()), client(settings()) {
        support::writeFile(secrets.path("s1"), "one\ntwo\n");
        server.onGetClass("CIM_Fan", Reply::ok(classXml("CIM_Fan")));
        client.setTimeout(5000);
        client.connectLocal();
    }

    ClientSettings settings() const {
        ClientSettings settings;
        settings.authenticationDirectories = {secrets.path()};
        return settings;
    }

    static Reply challenge(const std::string& file) {
        return Reply::http(401, {{"WWW-Authenticate", "Local \"" + file + "\""}});
    }

    void getFan() {
        const CIMClass found =
            client.getClass(kNamespace, CIMName("CIM_Fan"), true, true, false, CIMPropertyList());
        EXPECT_TRUE(found.getClassName().equal(CIMName("CIM_Fan")));
    }

    std::string authorization(std::size_t request) const {
        return server.requests().at(request).header("PegasusAuthorization");
    }

    void expectAccepted() {
        getFan();
        ASSERT_EQ(server.requests().size(), 2U);
        EXPECT_EQ(authorization(0), "Local \"" + user + "\"");
        EXPECT_EQ(authorization(1), "Local \"" + user + ":" + secrets.path("s1") + ":onetwo\"");
        EXPECT_EQ(server.requests()[0].body, server.requests()[1].body);
    }

    void expectRefused(const Reply& reply) {
        const std::size_t before = server.requests().size();
        server.onNext(reply);
        EXPECT_EQ(messageOf<CIMClientHTTPErrorException>([&] { getFan(); }),
                  "HTTP error: HTTP/1.1 401 Unauthorized");
        EXPECT_EQ(server.requests().size(), before + 1);
        getFan();
    }

    const std::string user = effectiveUserName();
    support::FakeCimServer server;
    support::ScopedEnvironment socketName;
    support::TempDirectory secrets;
    support::TempDirectory other;
    CIMClientRep client;
};

TEST_F(CIMClientAuthenticationTest, AnswersAChallengeOnTheSameConnection) {
    server.onNext(challenge(secrets.path("s1")));
    expectAccepted();
    EXPECT_EQ(server.connectionCount(), 1U);
}

TEST_F(CIMClientAuthenticationTest, AChallengeMayHaveABody) {
    server.onNext(Reply::http(401, {{"WWW-Authenticate", "Local \"" + secrets.path("s1") + "\""}},
                              "<html>who are you?</html>"));
    expectAccepted();
    EXPECT_EQ(server.connectionCount(), 1U);
}

TEST_F(CIMClientAuthenticationTest, AChallengeMayHaveNoLengthAndNoBody) {
    const Stopwatch watch;
    server.onNext(challenge(secrets.path("s1")).withoutLength());
    expectAccepted();
    EXPECT_EQ(server.connectionCount(), 1U);
    EXPECT_LT(watch.milliseconds(), 2000);
}

TEST_F(CIMClientAuthenticationTest, AChallengeMayCloseTheConnection) {
    server.onNext(challenge(secrets.path("s1")).header("Connection", "close").thenClose());
    expectAccepted();
    EXPECT_EQ(server.connectionCount(), 2U);
}

TEST_F(CIMClientAuthenticationTest, ASecondChallengeIsARefusal) {
    server.onNext(challenge(secrets.path("s1")));
    server.onNext(challenge(secrets.path("s1")));
    EXPECT_EQ(messageOf<CIMClientHTTPErrorException>([&] { getFan(); }),
              "HTTP error: HTTP/1.1 401 Unauthorized");
    EXPECT_EQ(server.requests().size(), 2U);
}

TEST_F(CIMClientAuthenticationTest, TheNextRequestBeginsAnew) {
    server.onNext(challenge(secrets.path("s1")));
    expectAccepted();
    getFan();
    EXPECT_EQ(authorization(2), "Local \"" + user + "\"");
}

TEST_F(CIMClientAuthenticationTest, SendsNoFileThatIsNoSecret) {
    support::writeFile(other.path("private"), "private");
    ASSERT_EQ(symlink(other.path("private").c_str(), secrets.path("link").c_str()), 0);
    const std::string last = secrets.path().substr(secrets.path().rfind('/'));
    expectRefused(challenge(other.path("private")));
    expectRefused(challenge(secrets.path("link")));
    expectRefused(challenge(secrets.path("missing")));
    expectRefused(challenge(secrets.path(".." + last + "/s1")));
    expectRefused(challenge("/etc/passwd"));
    if (geteuid() == 0) {
        support::writeFile(secrets.path("stranger"), "private");
        ASSERT_EQ(chown(secrets.path("stranger").c_str(), 12345, 12345), 0);
        expectRefused(challenge(secrets.path("stranger")));
    }
}

TEST_F(CIMClientAuthenticationTest, FindsItsChallengeAmongOthers) {
    server.onNext(Reply::http(401, {{"WWW-Authenticate", "Basic realm=\"x\""},
                                    {"WWW-Authenticate", "Local \"" + secrets.path("s1") + "\""}}));
    expectAccepted();
}

TEST_F(CIMClientAuthenticationTest, AnswersNoOtherScheme) {
    expectRefused(Reply::http(401, {{"WWW-Authenticate", "Basic realm=\"x\""}}));
    expectRefused(Reply::http(401, {}));
}

TEST_F(CIMClientAuthenticationTest, BothRequestsShareOneTimeout) {
    client.setTimeout(300);
    server.onNext(challenge(secrets.path("s1")));
    server.onNext(Reply::silence());
    const Stopwatch watch;
    EXPECT_THROW(getFan(), ConnectionTimeoutException);
    EXPECT_LT(watch.milliseconds(), 2000);
}

}  // namespace
}  // namespace Pegasus
