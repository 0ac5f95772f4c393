#pragma once

// Why values are missing, as the CIM server itself tells it.

#include <map>
#include <optional>
#include <string>
#include <utility>

#include "cim/LocalServer.h"
#include "script/AnsweredClass.h"

namespace sennetctl {

class MissingValues {
  public:
    /// The server must outlive it. It is asked once, when the first reason is wanted: to answer it
    /// must look at the whole machine.
    explicit MissingValues(LocalServer& theServer) : server(theServer) {}

    /// Such as "Needs Root, run as root or let the service run"; empty when the server does not
    /// tell, as only cimomd does.
    /// @param property  empty for the reason why the class has no instances
    std::string reasonFor(const AnsweredClass& answered, const std::string& property);

  private:
    using Reasons = std::map<std::pair<std::string, std::string>, std::string>;

    const Reasons& known();

    LocalServer& server;
    std::optional<Reasons> reasons;
};

}  // namespace sennetctl
