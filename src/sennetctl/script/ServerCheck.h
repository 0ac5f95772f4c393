#pragma once

// Checks an inventory script against what the CIM server of this machine answers.

#include <Velm/Properties.h>

#include <optional>
#include <string>
#include <vector>

#include "cim/LocalServer.h"
#include "report/Finding.h"
#include "script/AnsweredClass.h"
#include "script/MissingValues.h"
#include "script/ScriptModel.h"

namespace sennetctl {

class ServerCheck {
  public:
    /// What is told besides classes, properties and values.
    struct Scope {
        bool sizes = false;  ///< columns whose size is a guess
        bool names = true;   ///< what becomes of titles and names
    };

    /// All must outlive the check.
    ServerCheck(LocalServer& server, MissingValues& missing, const Velm::Properties& texts,
                Scope scope, std::vector<Finding>& findings)
        : server(server), missing(missing), texts(texts), scope(scope), findings(findings) {}

    /// Appends the findings for a script that the generator does not give up, and enters how the
    /// server spells the classes. Throws CannotRun when the server breaks down.
    void check(ScriptModel& model);

  private:
    std::optional<AnsweredClass> ask(const ScriptModel& model, ScriptSlot& slot);
    void checkPairing(const ScriptModel& model, const std::vector<AnsweredClass>& classes);
    void checkCounts(const ScriptModel& model, const std::vector<AnsweredClass>& classes);
    void checkColumns(const ScriptModel& model, const AnsweredClass& answered);
    void add(const ScriptModel& model, const ScriptText& place, Severity severity,
             const std::string& message);

    LocalServer& server;
    MissingValues& missing;
    const Velm::Properties& texts;
    Scope scope;
    std::vector<Finding>& findings;
};

}  // namespace sennetctl
