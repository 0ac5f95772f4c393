#include "SennetConverter/sql/Cim2SqlConverter.h"

#include <initializer_list>

#include "CimScriptParser/CimScriptParser.h"
#include "SennetConverter/framework/CimInstanceLists.h"
#include "SennetConverter/framework/SennetUtilities.h"
#include "SennetConverter/sql/SqlDialect.h"

namespace Pegasus {

namespace {

String concatenate(std::initializer_list<String> pieces) {
    String text;
    for (const String& piece : pieces) {
        text.append(piece);
    }
    return text;
}

String uniqueIndex(const SqlDialect& dialect, const String& stem) {
    if (dialect.uniqueIndexColumns == nullptr) {
        return String();
    }
    return concatenate({"create unique index KWX_I", stem, " on KWX_", stem, "\r\n(\r\n",
                        dialect.uniqueIndexColumns, ");\r\n\r\n"});
}

}  // namespace

void Cim2SqlConverter::printOutput(CimScriptParser& parser, Array<CIMClass>& classes,
                                   CimInstanceLists& instanceLists) {
    if (holdsData(classes, instanceLists)) {
        openFileIfNeeded();
        PrintRDBMS(parser, classes, instanceLists);
    }
}

String Cim2SqlConverter::hashString(String text) {
    return SennetUtilities::hashString(text, maxNameLength);
}

void Cim2SqlConverter::writeSchema(const SqlDialect& dialect, CimScriptParser& parser,
                                   Array<CIMClass>& classes) {
    const String stem = formatTitle(parser.getTitle());
    const String table = String("KWX_") + stem;
    const String view = String("KWX_V") + stem;
    Output(concatenate({"drop table ", table, dialect.dropTableEnd, "create table ", table,
                        " (\r\n", dialect.fixedColumns})
               .getCString());
    writeColumns(dialect, parser, classes);
    Output(concatenate({dialect.createTableEnd,
                        uniqueIndex(dialect, stem),
                        "alter table ",
                        table,
                        " add ",
                        dialect.primaryKey,
                        "drop view ",
                        view,
                        dialect.dropViewEnd,
                        "create view ",
                        view,
                        "\r\nas\r\nselect\r\n",
                        dialect.viewColumns,
                        "   ",
                        table,
                        dialect.fromClause,
                        stem,
                        "\r\n",
                        dialect.whereClause,
                        stem,
                        dialect.joinColumn,
                        dialect.insertOpener,
                        stem,
                        dialect.insertEnd})
               .getCString());
}

void Cim2SqlConverter::writeColumns(const SqlDialect& dialect, CimScriptParser& parser,
                                    Array<CIMClass>& classes) {
    const auto format = [this](const String& name) {
        return SennetUtilities::formatPropertyName4quvelle(name, maxNameLength);
    };
    forEachColumn(parser, classes, format, [&](const Column& column) {
        const String length = SennetUtilities::limitLength(
            getMaxLength(classes[column.classIndex], column.property.getString()));
        Output(concatenate({"\r\n   ", substituteValues(column.name), dialect.typeOpener, length,
                            dialect.columnCloser, column.last ? "" : ","})
                   .getCString());
    });
}

}  // namespace Pegasus
