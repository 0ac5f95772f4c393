#pragma once

// A server with one class, CIM_Fan, in every namespace.

#include <string>

#include "support/FakeCimServer.h"
#include "support/ScopedEnvironment.h"

namespace sennetctl {

/// The class with a key, a size in text and a number whose names are 2 Enabled and 3 Disabled.
inline std::string fanClassXml() {
    return R"(<CLASS NAME="CIM_Fan"><PROPERTY NAME="DeviceID" TYPE="string">)"
           R"(<QUALIFIER NAME="MaxLen" TYPE="uint32"><VALUE>64</VALUE></QUALIFIER></PROPERTY>)"
           R"(<PROPERTY NAME="State" TYPE="uint16"><QUALIFIER NAME="ValueMap" TYPE="string">)"
           R"(<VALUE.ARRAY><VALUE>2</VALUE><VALUE>3</VALUE></VALUE.ARRAY></QUALIFIER>)"
           R"(<QUALIFIER NAME="Values" TYPE="string"><VALUE.ARRAY><VALUE>Enabled</VALUE>)"
           R"(<VALUE>Disabled</VALUE></VALUE.ARRAY></QUALIFIER></PROPERTY>)"
           R"(<PROPERTY NAME="Bytes" TYPE="uint64"/><PROPERTY NAME="Spare" TYPE="string"/></CLASS>)";
}

/// Of any class; `properties` are PROPERTY elements.
inline std::string instanceXml(const std::string& className, const std::string& id,
                               const std::string& properties) {
    return "<VALUE.NAMEDINSTANCE><INSTANCENAME CLASSNAME=\"" + className +
           "\"><KEYBINDING NAME=\"DeviceID\"><KEYVALUE VALUETYPE=\"string\">" + id +
           "</KEYVALUE></KEYBINDING></INSTANCENAME><INSTANCE CLASSNAME=\"" + className +
           "\"><PROPERTY NAME=\"DeviceID\" TYPE=\"string\"><VALUE>" + id + "</VALUE></PROPERTY>" +
           properties + "</INSTANCE></VALUE.NAMEDINSTANCE>";
}

inline std::string fanXml(const std::string& id, const std::string& state,
                          const std::string& bytes) {
    return instanceXml("CIM_Fan", id,
                       "<PROPERTY NAME=\"State\" TYPE=\"uint16\"><VALUE>" + state +
                           "</VALUE></PROPERTY><PROPERTY NAME=\"Bytes\" TYPE=\"uint64\"><VALUE>" +
                           bytes + "</VALUE></PROPERTY>");
}

class FanServer {
  public:
    FanServer() {
        server.onGetClass("CIM_Fan", support::Reply::ok(fanClassXml()));
        setFans(fanXml("fan1", "2", "10") + fanXml("fan2", "3", "20"));
    }

    void setFans(const std::string& instances) {
        server.onEnumerateInstances("CIM_Fan", support::Reply::ok(instances));
    }

    support::FakeCimServer server;

  private:
    support::ScopedEnvironment place{"CIM_LOCAL_SOCKET", server.socketPath()};
};

}  // namespace sennetctl
