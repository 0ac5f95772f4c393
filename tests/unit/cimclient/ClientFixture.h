#pragma once

// A client on a scripted server, and the CIM-XML that the tests let it answer.

#include <Pegasus/Client/CIMClient.h>
#include <gtest/gtest.h>

#include <string>

#include "TestConnections.h"
#include "support/FakeCimServer.h"
#include "support/ScopedEnvironment.h"

namespace testing_client {

inline const Pegasus::CIMNamespaceName kNamespace("root/cimv2");

inline std::string classXml(const std::string& name) {
    return "<CLASS NAME=\"" + name + "\"/>";
}

// An instance of CIM_Fan with a key and the property Speed, whose text may be anything.
inline std::string fanXml(const std::string& id, const std::string& speed) {
    return "<VALUE.NAMEDINSTANCE><INSTANCENAME CLASSNAME=\"CIM_Fan\"><KEYBINDING NAME=\"ID\">"
           "<KEYVALUE VALUETYPE=\"string\">" +
           id +
           "</KEYVALUE></KEYBINDING></INSTANCENAME><INSTANCE CLASSNAME=\"CIM_Fan\">"
           "<PROPERTY NAME=\"ID\" TYPE=\"string\"><VALUE>" +
           id + "</VALUE></PROPERTY><PROPERTY NAME=\"Speed\" TYPE=\"uint16\"><VALUE>" + speed +
           "</VALUE></PROPERTY></INSTANCE></VALUE.NAMEDINSTANCE>";
}

class ClientFixture : public testing::Test {
  protected:
    ClientFixture() : socketName("CIM_LOCAL_SOCKET", server.socketPath()) {
        client.setTimeout(5000);
    }

    std::string nameOfClass(const char* name) {
        return text(client.getClass(kNamespace, Pegasus::CIMName(name)).getClassName().getString());
    }

    Pegasus::Array<Pegasus::CIMInstance> fans() {
        return client.enumerateInstances(kNamespace, Pegasus::CIMName("CIM_Fan"));
    }

    // That the client is none the worse for what came before.
    void expectNextRequestWorks() {
        server.onNext(support::Reply::ok(classXml("CIM_Next")));
        EXPECT_EQ(nameOfClass("CIM_Next"), "CIM_Next");
    }

    support::FakeCimServer server;
    support::ScopedEnvironment socketName;
    Pegasus::CIMClient client;
};

}  // namespace testing_client
