#include "report/Failure.h"

#include <ostream>

#include "report/Text.h"

namespace sennetctl {

namespace {

void addPlace(Json& one, const char* member, unsigned number) {
    if (number > 0) {
        one[member] = number;
    }
}

}  // namespace

std::string textOf(const Failure& failure) {
    if (failure.file.empty()) {
        return failure.reason;
    }
    std::string place = failure.file + ":";
    for (const unsigned number : {failure.line, failure.column}) {
        place += number > 0 ? std::to_string(number) + ":" : "";
    }
    return place + " " + failure.reason;
}

Json jsonOf(const Failure& failure) {
    Json one = Json::object();
    if (!failure.file.empty()) {
        one["file"] = failure.file;
    }
    addPlace(one, "line", failure.line);
    addPlace(one, "column", failure.column);
    one["message"] = failure.reason;
    return one;
}

void tellFailure(const Failure& failure, const Output& output) {
    output.err << "sennetctl: " << printable(textOf(failure)) << '\n';
}

void printFailure(const Failure& failure, const Output& output) {
    tellFailure(failure, output);
    if (output.json) {
        Json document = Json::object();
        document["error"] = jsonOf(failure);
        printJson(document, output);
    }
}

void tellFailures(const std::vector<Failure>& failures, const Output& output) {
    for (const Failure& failure : failures) {
        tellFailure(failure, output);
    }
}

void addFailures(const std::vector<Failure>& failures, Json& document) {
    if (failures.empty()) {
        return;
    }
    document["error"] = jsonOf(failures.front());
    document["failures"] = Json::array();
    for (const Failure& failure : failures) {
        document["failures"].push_back(jsonOf(failure));
    }
}

}  // namespace sennetctl
