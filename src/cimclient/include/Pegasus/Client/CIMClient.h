// The client of a CIM server on this machine: CIM operations over HTTP (DSP0200) on a Unix domain
// socket. This header brings everything that a program needs to work with what it returns.

#pragma once

#include <Pegasus/Client/ClientExceptions.h>
#include <Pegasus/Common/Array.h>
#include <Pegasus/Common/CIMClass.h>
#include <Pegasus/Common/CIMDateTime.h>
#include <Pegasus/Common/CIMInstance.h>
#include <Pegasus/Common/CIMName.h>
#include <Pegasus/Common/CIMObjectPath.h>
#include <Pegasus/Common/CIMProperty.h>
#include <Pegasus/Common/CIMPropertyList.h>
#include <Pegasus/Common/CIMQualifier.h>
#include <Pegasus/Common/CIMType.h>
#include <Pegasus/Common/CIMValue.h>
#include <Pegasus/Common/Config.h>
#include <Pegasus/Common/Exception.h>
#include <Pegasus/Common/String.h>

#include <memory>

namespace Pegasus {

class CIMClientRep;

/// One connection to a CIM server. Not to be used from two threads at a time; different clients
/// are independent of each other.
///
/// What a failed operation raises:
/// - NotConnectedException: before connectLocal or after disconnect;
/// - AlreadyConnectedException: connectLocal when connected;
/// - CannotConnectException: no server to connect to, or none that can be trusted;
/// - ConnectionTimeoutException: the operation did not end within the time-out;
/// - CIMException with its code: the server reports a CIM status above 0, in whatever place;
/// - CIMClientHTTPErrorException: an HTTP status other than 200, or a field CIMError;
/// - CIMClientMalformedHTTPException: the connection was closed or reset before the answer's end,
///   broken HTTP or chunks, a content type that is not XML, a malformed CIMStatusCode, a header or
///   an answer above the size limits;
/// - CIMClientXmlException: a complete HTTP answer whose XML is malformed, cut short, or not what
///   the operation returns;
/// - CIMClientResponseException: an answer to another request, invalid UTF-8, or neither the class
///   that was asked for nor an error.
///
/// After every failure but a CIMException in a whole answer the connection is given up and the next
/// operation connects again; a request of which any octet was sent is never sent a second time,
/// except as the answer to an authentication challenge.
class CIMClient {
  public:
    /// Not connected, with a time-out of 20 seconds.
    CIMClient();
    ~CIMClient();
    CIMClient(const CIMClient&) = delete;
    CIMClient& operator=(const CIMClient&) = delete;

    /// The time that each of the following operations may take from connecting to the last octet
    /// of its answer. 0 leaves no time for anything.
    void setTimeout(Uint32 timeoutMilliseconds);

    /// Connects to the CIM server of this machine. Looked for in this order:
    /// 1. the socket that the environment variable CIM_LOCAL_SOCKET names, and only that;
    /// 2. the first socket that answers of those where servers are known to listen;
    /// 3. when no CIM server is installed here, an object manager of its own, started as a child
    ///    process that ends with the connection. The variable CIM_COMMAND names another program
    ///    for this; CIM_EMBEDDED=never forbids it.
    /// A server is only trusted when it runs as root or as the effective user. The environment is
    /// not heeded in a set-user-ID program.
    void connectLocal();

    /// Closes the connection. Nothing happens when there is none. Raises nothing.
    void disconnect();

    /// The definition of a class of the server (GetClass of DSP0200). A null property list means
    /// all properties. An unknown class is a CIMException of code 6 (CIM_ERR_NOT_FOUND).
    CIMClass getClass(const CIMNamespaceName& nameSpace, const CIMName& className,
                      Boolean localOnly = true, Boolean includeQualifiers = true,
                      Boolean includeClassOrigin = false,
                      const CIMPropertyList& propertyList = CIMPropertyList());

    /// The instances of a class and its subclasses (EnumerateInstances of DSP0200) in the server's
    /// order; all of them or an exception.
    Array<CIMInstance> enumerateInstances(const CIMNamespaceName& nameSpace,
                                          const CIMName& className, Boolean deepInheritance = true,
                                          Boolean localOnly = true,
                                          Boolean includeQualifiers = false,
                                          Boolean includeClassOrigin = false,
                                          const CIMPropertyList& propertyList = CIMPropertyList());

    /// The names of the subclasses of a class, or with a null name of the classes that have no
    /// superclass; with deepInheritance also those of all classes below (EnumerateClassNames of
    /// DSP0200).
    Array<CIMName> enumerateClassNames(const CIMNamespaceName& nameSpace,
                                       const CIMName& className = CIMName(),
                                       Boolean deepInheritance = false);

  private:
    std::unique_ptr<CIMClientRep> rep;
};

}  // namespace Pegasus
