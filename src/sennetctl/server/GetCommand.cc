#include "server/GetCommand.h"

#include <optional>
#include <ostream>

#include "cim/CimText.h"
#include "cim/LocalServer.h"
#include "cim/ValueText.h"
#include "report/AnswerRoom.h"
#include "report/Finding.h"
#include "report/Json.h"
#include "report/Progress.h"
#include "report/Text.h"
#include "report/TextTable.h"
#include "report/WholeFile.h"

namespace sennetctl {

namespace {

using namespace Pegasus;

struct Column {
    CIMName name;
    std::optional<CIMProperty> declared;
};

/// What the server answered.
struct ClassContent {
    CIMClass definition;
    std::vector<CIMInstance> instances;
};

ClassContent readClass(const GetOptions& options, const Output& output) {
    const Progress progress(output);
    progress.show("asking for " + options.className);
    LocalServer server(options.timeoutSeconds * 1000);
    try {
        ClassContent content{server.getClass(options.nameSpace, options.className), {}};
        server.setTimeout(LocalServer::kTimeoutMilliseconds);
        content.instances = server.instances(options.nameSpace, options.className);
        return content;
    } catch (const CIMException& failure) {
        throw CannotRun(options.nameSpace + ":" + options.className + ": " + reasonOf(failure));
    }
}

std::optional<CIMProperty> declaration(const CIMClass& definition, const CIMName& name) {
    const Uint32 position = definition.findProperty(name);
    if (position == PEG_NOT_FOUND) {
        return std::nullopt;
    }
    return CIMClass(definition).getProperty(position);
}

CIMValue valueIn(const CIMInstance& instance, const CIMName& name) {
    const Uint32 position = instance.findProperty(name);
    return position == PEG_NOT_FOUND ? CIMValue() : instance.getProperty(position).getValue();
}

bool hasValue(const std::vector<CIMInstance>& instances, const CIMName& name) {
    for (const CIMInstance& instance : instances) {
        if (!valueIn(instance, name).isNull()) {
            return true;
        }
    }
    return false;
}

std::vector<Column> chooseColumns(const GetOptions& options, const ClassContent& content) {
    std::vector<Column> columns;
    for (const std::string& text : options.properties) {
        const CIMName name = nameFrom(text);
        columns.push_back({name, declaration(content.definition, name)});
    }
    if (!columns.empty()) {
        return columns;
    }
    CIMClass definition = content.definition;
    for (Uint32 i = 0; i < definition.getPropertyCount(); ++i) {
        const CIMProperty property = definition.getProperty(i);
        if (hasValue(content.instances, property.getName())) {
            columns.push_back({property.getName(), property});
        }
    }
    return columns;
}

const CIMProperty* pointerTo(const Column& column) {
    return column.declared ? &*column.declared : nullptr;
}

/// What is wrong with the properties that were asked for.
std::vector<std::string> faultsOf(const std::vector<Column>& columns, const ClassContent& content) {
    std::vector<std::string> faults;
    for (const Column& column : columns) {
        if (!column.declared) {
            faults.push_back(textOf(content.definition.getClassName()) + " declares no property " +
                             textOf(column.name));
        }
    }
    return faults;
}

Json findingsJson(const std::vector<std::string>& faults) {
    Json findings = Json::array();
    for (const std::string& fault : faults) {
        Json one = Json::object();
        one["severity"] = nameOf(Severity::Warning);
        one["message"] = fault;
        findings.push_back(std::move(one));
    }
    return findings;
}

void printInstancesJson(const GetOptions& options, const ClassContent& content,
                        const std::vector<Column>& columns, const std::vector<std::string>& faults,
                        const Output& output) {
    AnswerRoom room;
    ValueText values(room);
    Json rows = Json::array();
    for (const CIMInstance& instance : content.instances) {
        Json row = Json::object();
        for (const Column& column : columns) {
            const std::string name = textOf(column.name);
            room.take(sizeof(std::string) + name.size());
            row[name] = values.json(valueIn(instance, column.name), pointerTo(column));
        }
        rows.push_back(std::move(row));
    }
    Json document = Json::object();
    document["class"] = textOf(content.definition.getClassName());
    document["namespace"] = options.nameSpace;
    document["instances"] = std::move(rows);
    document["findings"] = findingsJson(faults);
    printJson(document, output);
}

void printTable(const ClassContent& content, const std::vector<Column>& columns,
                const Output& output) {
    std::vector<std::string> titles;
    titles.reserve(columns.size());
    for (const Column& column : columns) {
        titles.push_back(textOf(column.name));
    }
    TextTable table(titles, TextTable::Cells::Fitting);
    AnswerRoom room;
    ValueText values(room);
    for (const CIMInstance& instance : content.instances) {
        std::vector<std::string> cells;
        cells.reserve(columns.size());
        for (const Column& column : columns) {
            cells.push_back(values.shown(valueIn(instance, column.name), pointerTo(column)));
        }
        table.addRow(std::move(cells));
    }
    if (!content.instances.empty()) {
        table.print(output);
    }
    output.out << counted(content.instances.size(), "instance") << '\n';
}

}  // namespace

int showInstances(const GetOptions& options, const Output& output) {
    const ClassContent content = readClass(options, output);
    const std::vector<Column> columns = chooseColumns(options, content);
    const std::vector<std::string> faults = faultsOf(columns, content);
    if (output.json) {
        printInstancesJson(options, content, columns, faults, output);
    } else {
        printTable(content, columns, output);
    }
    for (const std::string& fault : faults) {
        output.err << "sennetctl: " << printable(fault) << '\n';
    }
    return content.instances.empty() || !faults.empty() ? kFindings : kFine;
}

}  // namespace sennetctl
