// The body of CIMClient: keeps the connection, and makes an HTTP exchange out of an operation and
// a result or an exception out of the answer. The public interface says what is raised when.

#pragma once

#include <Pegasus/Client/CIMClient.h>

#include <memory>
#include <string>

#include "client/ClientSettings.h"
#include "client/Deadline.h"
#include "client/HttpExchange.h"
#include "client/LocalConnector.h"
#include "client/MemoryBudget.h"

namespace Pegasus {

class CIMClientRep {
  public:
    explicit CIMClientRep(ClientSettings settings);

    void setTimeout(Uint32 milliseconds) { timeoutMilliseconds = milliseconds; }
    void connectLocal();
    void disconnect();
    CIMClass getClass(const CIMNamespaceName& nameSpace, const CIMName& className,
                      Boolean localOnly, Boolean includeQualifiers, Boolean includeClassOrigin,
                      const CIMPropertyList& propertyList);
    Array<CIMInstance> enumerateInstances(const CIMNamespaceName& nameSpace,
                                          const CIMName& className, Boolean deepInheritance,
                                          Boolean localOnly, Boolean includeQualifiers,
                                          Boolean includeClassOrigin,
                                          const CIMPropertyList& propertyList);
    Array<CIMName> enumerateClassNames(const CIMNamespaceName& nameSpace, const CIMName& className,
                                       Boolean deepInheritance);

  private:
    /// Closes the connection at its end unless told to keep it.
    class ConnectionGuard;

    template <typename Decode>
    auto perform(const char* method, const CIMNamespaceName& nameSpace, std::string body,
                 Uint64 answerLimit, Decode decode);

    std::string nextMessageId();
    void makeReady(const Deadline& deadline);
    std::unique_ptr<HttpExchange> start(const HttpRequest& request, const Deadline& deadline,
                                        Uint64 answerLimit);
    std::unique_ptr<HttpExchange> exchange(HttpRequest& request, const Deadline& deadline,
                                           Uint64 answerLimit);
    bool answerChallenge(const HttpExchange& refused, HttpRequest& request) const;

    ClientSettings settings;
    MemoryBudget memory;
    Uint32 timeoutMilliseconds = 20000;
    Uint32 lastMessageId = 1000;
    bool connected = false;  // by the user's word; the connection may be gone meanwhile
    ServerConnection connection;
};

}  // namespace Pegasus
