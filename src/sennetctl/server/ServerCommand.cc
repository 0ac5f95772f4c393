#include "server/ServerCommand.h"

#include <Pegasus/Client/LocalServerSearch.h>
#include <fmt/format.h>
#include <pwd.h>

#include <algorithm>
#include <chrono>
#include <optional>
#include <ostream>

#include "cim/CimText.h"
#include "cim/LocalServer.h"
#include "report/Json.h"
#include "report/Text.h"
#include "report/TextTable.h"
#include "report/WholeFile.h"

namespace sennetctl {

namespace {

constexpr const char* kUsualNamespaces[] = {"root/cimv2", "root/velmira",    "root/interop",
                                            "interop",    "root/PG_InterOp", "root"};
constexpr const char* kInteropNamespaces[] = {"root/interop", "interop", "root/PG_InterOp"};

struct NamespaceContent {
    std::string name;
    std::optional<std::vector<std::string>> classes;  // none when the server does not tell
    std::string failure;
};

std::string userName(unsigned user) {
    const passwd* entry = ::getpwuid(user);
    return entry == nullptr ? std::to_string(user) : entry->pw_name;
}

bool isKnown(const std::vector<std::string>& names, const std::string& name) {
    return std::any_of(names.begin(), names.end(), [&](const std::string& known) {
        return Pegasus::String::equalNoCase(Pegasus::String(known.c_str()),
                                            Pegasus::String(name.c_str()));
    });
}

void addOnce(std::vector<std::string>& names, const std::string& name) {
    if (!isKnown(names, name)) {
        names.push_back(name);
    }
}

/// The namespaces that a server tells itself by instances of CIM_Namespace.
void addToldNamespaces(LocalServer& server, std::vector<std::string>& names) {
    for (const char* place : kInteropNamespaces) {
        try {
            for (const Pegasus::CIMInstance& told : server.instances(place, "CIM_Namespace")) {
                const Pegasus::Uint32 position = told.findProperty(Pegasus::CIMName("Name"));
                if (position != Pegasus::PEG_NOT_FOUND) {
                    addOnce(names, textOf(told.getProperty(position).getValue().toString()));
                }
            }
        } catch (const Pegasus::Exception&) {
            // Most servers have but one of these namespaces, and some have none.
            continue;
        }
    }
}

std::vector<NamespaceContent> readNamespaces(LocalServer& server, const ServerOptions& options) {
    std::vector<std::string> candidates(std::begin(kUsualNamespaces), std::end(kUsualNamespaces));
    for (const std::string& wanted : options.namespaces) {
        addOnce(candidates, wanted);
    }
    addToldNamespaces(server, candidates);
    std::vector<NamespaceContent> contents;
    for (const std::string& name : candidates) {
        try {
            contents.push_back({name, server.classNames(name), {}});
        } catch (const Pegasus::CIMException& failure) {
            if (failure.getCode() != Pegasus::CIM_ERR_INVALID_NAMESPACE) {
                contents.push_back({name, std::nullopt, reasonOf(failure)});
            } else if (isKnown(options.namespaces, name)) {
                contents.push_back({name, std::nullopt, "the server has no such namespace"});
            }
        }
    }
    return contents;
}

/// The shortest of a few requests: the others had to wait for something else.
double roundTripMilliseconds(LocalServer& server) {
    constexpr int kRequests = 5;
    double shortest = 0;
    for (int i = 0; i < kRequests; ++i) {
        const auto start = std::chrono::steady_clock::now();
        try {
            server.getClass("root/cimv2", "CIM_ManagedElement");
        } catch (const Pegasus::CIMException&) {
            // A refusal travels as far.
        }
        const std::chrono::duration<double, std::milli> taken =
            std::chrono::steady_clock::now() - start;
        shortest = i == 0 ? taken.count() : std::min(shortest, taken.count());
    }
    return shortest;
}

void printPlaces(const Pegasus::LocalServerSearch& search, const Output& output) {
    output.out << "Places in the order in which they are tried:\n\n";
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

int showFailure(const Pegasus::LocalServerSearch& search, const Output& output) {
    if (output.json) {
        Json document = Json::object();
        document["places"] = placesJson(search);
        document["failure"] = search.failure;
        printJson(document, output);
        return kFindings;
    }
    printPlaces(search, output);
    output.out << "No server is reached: " << printable(search.failure) << '\n';
    return kFindings;
}

}  // namespace

int showServer(const ServerOptions& options, const Output& output) {
    const Pegasus::LocalServerSearch search =
        Pegasus::searchLocalServer(LocalServer::kTimeoutMilliseconds);
    if (!search.failure.empty()) {
        return showFailure(search, output);
    }
    LocalServer server;
    const std::vector<NamespaceContent> contents = readNamespaces(server, options);
    const double milliseconds = roundTripMilliseconds(server);
    if (output.json) {
        Json document = Json::object();
        document["places"] = placesJson(search);
        document["roundTripMilliseconds"] = milliseconds;
        document["namespaces"] = namespacesJson(contents);
        printJson(document, output);
        return kFine;
    }
    printPlaces(search, output);
    output.out << fmt::format("Round trip of a request: {:.2f} ms\n\n", milliseconds);
    printNamespaces(contents, options.listClasses, output);
    return kFine;
}

}  // namespace sennetctl
