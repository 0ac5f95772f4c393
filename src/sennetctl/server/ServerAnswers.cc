#include "server/ServerAnswers.h"

#include <algorithm>
#include <chrono>
#include <iterator>

#include "cim/CimText.h"
#include "report/WholeFile.h"

namespace sennetctl {

namespace {

constexpr const char* kUsualNamespaces[] = {"root/cimv2", "root/velmira",    "root/interop",
                                            "interop",    "root/PG_InterOp", "root"};
constexpr const char* kInteropNamespaces[] = {"root/interop", "interop", "root/PG_InterOp"};

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

/// A name that is none, which a server may tell, cannot be asked for.
void addTold(const Pegasus::CIMInstance& told, std::vector<std::string>& names) {
    const Pegasus::Uint32 position = told.findProperty(Pegasus::CIMName("Name"));
    if (position == Pegasus::PEG_NOT_FOUND) {
        return;
    }
    const std::string name = textOf(told.getProperty(position).getValue().toString());
    if (Pegasus::CIMNamespaceName::legal(Pegasus::String(name.c_str()))) {
        addOnce(names, name);
    }
}

/// The namespaces that a server tells itself by instances of CIM_Namespace.
void addToldNamespaces(LocalServer& server, std::vector<std::string>& names) {
    for (const char* place : kInteropNamespaces) {
        try {
            for (const Pegasus::CIMInstance& told : server.instances(place, "CIM_Namespace")) {
                addTold(told, names);
            }
        } catch (const Pegasus::Exception&) {
            // Most servers have but one of these namespaces, and some have none.
            continue;
        }
    }
}

void readNamespaces(LocalServer& server, const std::vector<std::string>& wanted,
                    ServerAnswers& answers) {
    std::vector<std::string> candidates(std::begin(kUsualNamespaces), std::end(kUsualNamespaces));
    for (const std::string& name : wanted) {
        addOnce(candidates, name);
    }
    addToldNamespaces(server, candidates);
    for (const std::string& name : candidates) {
        try {
            answers.namespaces.push_back({name, server.classNames(name), {}});
        } catch (const Pegasus::CIMException& failure) {
            if (failure.getCode() != Pegasus::CIM_ERR_INVALID_NAMESPACE) {
                answers.namespaces.push_back({name, std::nullopt, reasonOf(failure)});
            } else if (isKnown(wanted, name)) {
                answers.namespaces.push_back(
                    {name, std::nullopt, "the server has no such namespace"});
                answers.lacksWanted = true;
            }
        }
    }
}

/// The shortest of a few requests: the others had to wait for something else.
double roundTripMilliseconds(LocalServer& server) {
    constexpr int kRequests = 5;
    double shortest = 0;
    for (int i = 0; i < kRequests; ++i) {
        const auto start = std::chrono::steady_clock::now();
        server.requireAnswer();
        const std::chrono::duration<double, std::milli> taken =
            std::chrono::steady_clock::now() - start;
        shortest = i == 0 ? taken.count() : std::min(shortest, taken.count());
    }
    return shortest;
}

}  // namespace

ServerAnswers askServer(const std::vector<std::string>& wanted,
                        Pegasus::Uint32 timeoutMilliseconds) {
    ServerAnswers answers;
    try {
        LocalServer server(timeoutMilliseconds);
        readNamespaces(server, wanted, answers);
        answers.roundTripMilliseconds = roundTripMilliseconds(server);
    } catch (const CannotRun& failure) {
        answers.failure = failure.what();
    }
    return answers;
}

}  // namespace sennetctl
