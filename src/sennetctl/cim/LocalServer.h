#pragma once

// The CIM server of this machine, as the commands ask it.

#include <Pegasus/Client/CIMClient.h>

#include <string>
#include <vector>

namespace sennetctl {

/// A connection. Failures to reach the server or to understand it are CannotRun; a status that it
/// reports is Pegasus::CIMException.
class LocalServer {
  public:
    static constexpr Pegasus::Uint32 kTimeoutMilliseconds = 180000;  // as long as sennet waits

    /// Connects.
    /// @param theTimeoutMilliseconds  for the connection and for each answer
    explicit LocalServer(Pegasus::Uint32 theTimeoutMilliseconds = kTimeoutMilliseconds);

    /// From now on answers may take so long.
    void setTimeout(Pegasus::Uint32 milliseconds);

    /// Returns when the server answers something small, be it that it does not know it.
    void requireAnswer();

    Pegasus::CIMClass getClass(const std::string& nameSpace, const std::string& className);
    /// The instances of the class and its subclasses, with all properties.
    std::vector<Pegasus::CIMInstance> instances(const std::string& nameSpace,
                                                const std::string& className);
    /// All classes of a namespace, sorted by name.
    std::vector<std::string> classNames(const std::string& nameSpace);

  private:
    template <typename Operation>
    auto asked(Operation operation);

    Pegasus::CIMClient client;
    Pegasus::Uint32 timeoutMilliseconds = 0;
};

/// Throws CannotRun when the text is no name of a class or property.
Pegasus::CIMName nameFrom(const std::string& text);
/// Throws CannotRun when the text is no name of a namespace.
Pegasus::CIMNamespaceName namespaceFrom(const std::string& text);

}  // namespace sennetctl
