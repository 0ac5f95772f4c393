#pragma once

// What `sennetctl server` asks the server that is reached.

#include <optional>
#include <string>
#include <vector>

#include "cim/LocalServer.h"

namespace sennetctl {

struct NamespaceContent {
    std::string name;
    std::optional<std::vector<std::string>> classes;  ///< none when the server does not tell
    std::string failure;                              ///< why it does not tell
};

struct ServerAnswers {
    /// The usual namespaces that the server has and those that it tells itself; the wanted ones in
    /// any case.
    std::vector<NamespaceContent> namespaces;
    std::optional<double> roundTripMilliseconds;
    /// Whether one of the wanted namespaces is not there.
    bool lacksWanted = false;
    /// Why the answers end early; empty when they are complete.
    std::string failure;
};

/// Asks until the server fails, and keeps what it has said by then.
/// @param wanted               namespaces to look for besides the usual ones, legal names
/// @param timeoutMilliseconds  for each answer
ServerAnswers askServer(const std::vector<std::string>& wanted,
                        Pegasus::Uint32 timeoutMilliseconds);

}  // namespace sennetctl
