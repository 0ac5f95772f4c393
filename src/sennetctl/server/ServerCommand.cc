#include "server/ServerCommand.h"

#include <Pegasus/Client/LocalServerSearch.h>
#include <fmt/format.h>
#include <pwd.h>

#include <cstdlib>
#include <filesystem>
#include <ostream>
#include <system_error>

#include "cim/LocalServer.h"
#include "report/Json.h"
#include "report/Progress.h"
#include "report/Text.h"
#include "report/TextTable.h"
#include "server/ServerAnswers.h"

namespace sennetctl {

namespace {

std::string userName(unsigned user) {
    const passwd* entry = ::getpwuid(user);
    return entry == nullptr ? std::to_string(user) : entry->pw_name;
}

bool isPlaceNamed() {
    const char* named = ::secure_getenv("CIM_LOCAL_SOCKET");
    return named != nullptr && *named != '\0';
}

void printPlaces(const Pegasus::LocalServerSearch& search, const Output& output) {
    output.out << (isPlaceNamed()
                       ? "The only place that is tried, which CIM_LOCAL_SOCKET names:\n\n"
                       : "Places in the order in which they are tried:\n\n");
    TextTable table({"", "PLACE", "OWNER", "RESULT"});
    for (const Pegasus::LocalServerPlace& place : search.places) {
        table.addRow({place.chosen ? "*" : "", place.path,
                      place.owner ? userName(*place.owner) : "-", place.result});
    }
    table.print(output);
    output.out << '\n';
}

void printNamespaces(const std::vector<NamespaceContent>& contents, bool listClasses,
                     const Output& output) {
    TextTable table({"NAMESPACE", "CLASSES"});
    for (const NamespaceContent& content : contents) {
        table.addRow({content.name,
                      content.classes ? std::to_string(content.classes->size()) : content.failure});
    }
    table.print(output);
    for (const NamespaceContent& content : contents) {
        if (listClasses && content.classes && !content.classes->empty()) {
            output.out << '\n' << printable(content.name) << ":\n";
            for (const std::string& name : *content.classes) {
                output.out << "  " << printable(name) << '\n';
            }
        }
    }
}

Json placesJson(const Pegasus::LocalServerSearch& search) {
    Json places = Json::array();
    for (const Pegasus::LocalServerPlace& place : search.places) {
        Json one = Json::object();
        one["place"] = place.path;
        one["owner"] = place.owner ? Json(userName(*place.owner)) : Json(nullptr);
        one["result"] = place.result;
        one["chosen"] = place.chosen;
        places.push_back(std::move(one));
    }
    return places;
}

Json namespacesJson(const std::vector<NamespaceContent>& contents) {
    Json all = Json::array();
    for (const NamespaceContent& content : contents) {
        Json one = Json::object();
        one["namespace"] = content.name;
        one["classes"] = content.classes ? Json(*content.classes) : Json(nullptr);
        if (!content.failure.empty()) {
            one["failure"] = content.failure;
        }
        all.push_back(std::move(one));
    }
    return all;
}

void printAnswers(const ServerAnswers& answers, bool listClasses, const Output& output) {
    if (answers.roundTripMilliseconds) {
        output.out << fmt::format("Round trip of a request: {:.2f} ms\n\n",
                                  *answers.roundTripMilliseconds);
    }
    if (!answers.namespaces.empty()) {
        printNamespaces(answers.namespaces, listClasses, output);
    }
}

/// What to do about a server that was started and did not serve; nobody has seen its messages.
/// Empty for other servers.
std::string adviceOn(const Pegasus::LocalServerSearch& search) {
    std::error_code error;
    const bool isStarted = !search.places.empty() && search.places.back().chosen &&
                           std::filesystem::is_regular_file(search.places.back().path, error);
    return isStarted ? "see what it says when you start it: " + search.places.back().path +
                           " --socket ./trial.socket"
                     : std::string();
}

void printFailure(const Pegasus::LocalServerSearch& search, const ServerAnswers& answers,
                  const Output& output) {
    if (!search.failure.empty()) {
        output.out << "No server is reached: " << printable(search.failure) << '\n';
    } else if (!answers.failure.empty()) {
        output.out << "No useful answer: " << printable(answers.failure) << '\n';
        const std::string advice = adviceOn(search);
        if (!advice.empty()) {
            output.out << "The server was started for this command; " << printable(advice) << '\n';
        }
    }
}

Json answersJson(const Pegasus::LocalServerSearch& search, const ServerAnswers& answers) {
    Json document = Json::object();
    document["places"] = placesJson(search);
    if (isPlaceNamed()) {
        document["placesReason"] = "CIM_LOCAL_SOCKET names the only place that is tried";
    }
    if (search.failure.empty()) {
        document["roundTripMilliseconds"] =
            answers.roundTripMilliseconds ? Json(*answers.roundTripMilliseconds) : Json(nullptr);
        document["namespaces"] = namespacesJson(answers.namespaces);
    }
    const std::string& failure = search.failure.empty() ? answers.failure : search.failure;
    if (!failure.empty()) {
        document["failure"] = failure;
    }
    return document;
}

/// Asks the server that the search has reached, if any, while somebody waits.
ServerAnswers askReached(const Pegasus::LocalServerSearch& search, const ServerOptions& options,
                         const Output& output) {
    if (!search.failure.empty()) {
        return {};
    }
    const Progress progress(output);
    progress.show("waiting for the server's answers");
    return askServer(options.namespaces, options.timeoutSeconds * 1000);
}

}  // namespace

int showServer(const ServerOptions& options, const Output& output) {
    for (const std::string& name : options.namespaces) {
        namespaceFrom(name);
    }
    const Pegasus::LocalServerSearch search =
        Pegasus::searchLocalServer(options.timeoutSeconds * 1000);
    if (!output.json) {
        printPlaces(search, output);
        output.out << std::flush;
    }
    const ServerAnswers answers = askReached(search, options, output);
    if (output.json) {
        printJson(answersJson(search, answers), output);
    } else {
        printAnswers(answers, options.listClasses, output);
        printFailure(search, answers, output);
    }
    const bool fine = search.failure.empty() && answers.failure.empty() && !answers.lacksWanted;
    return fine ? kFine : kFindings;
}

}  // namespace sennetctl
