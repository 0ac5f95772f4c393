// mif-rows [--allow TOLERANCE]... FILE: prints the tables of a file as JSON, one table a line:
// name, attribute names, and rows of texts; then the groups that stand for themselves, each as a
// table of one row. Octets beyond ASCII are printed as ISO 8859-1.
// Status 1 when the file is refused, with the reason on standard error; 2 for a wrong call.

#include <cstdio>
#include <fstream>
#include <iostream>
#include <iterator>
#include <string>
#include <vector>

#include "mifreader/MifReader.h"

namespace {

std::string json(const std::string& octets) {
    std::string result = "\"";
    for (const char c : octets) {
        const auto code = static_cast<unsigned char>(c);
        if (code < 32 || code > 126 || c == '"' || c == '\\') {
            char buffer[8];
            std::snprintf(buffer, sizeof buffer, "\\u%04x", code);
            result += buffer;
        } else {
            result += c;
        }
    }
    return result + "\"";
}

std::string text(const Mif::Value& value) {
    if (value.kind == Mif::Value::Kind::Integer) {
        return json((value.negative ? "-" : "") + std::to_string(value.magnitude));
    }
    return value.kind == Mif::Value::Kind::Text ? json(value.text) : "null";
}

void print(const std::string& name, const Mif::Group& group, const std::vector<Mif::Row>& rows) {
    std::string line = "{\"name\": " + json(name) + ", \"columns\": [";
    const char* separator = "";
    for (const Mif::Attribute& attribute : group.attributes) {
        line += separator + json(attribute.name);
        separator = ", ";
    }
    line += "], \"rows\": [";
    const char* rowSeparator = "[";
    for (const Mif::Row& row : rows) {
        line += rowSeparator;
        separator = "";
        for (std::size_t i = 0; i < group.attributes.size(); ++i) {
            line += separator + text(row.at(group, i));
            separator = ", ";
        }
        line += "]";
        rowSeparator = ", [";
    }
    std::cout << line << "]}\n";
}

int usage() {
    std::cerr << "usage: mif-rows [--allow TOLERANCE]... FILE\n";
    return 2;
}

}  // namespace

int main(int argc, char** argv) {
    Mif::Tolerances tolerances;
    int next = 1;
    for (; next + 1 < argc && std::string(argv[next]) == "--allow"; next += 2) {
        const auto tolerance = Mif::parseTolerance(argv[next + 1]);
        if (!tolerance) {
            return usage();
        }
        tolerances.add(*tolerance);
    }
    if (next + 1 != argc) {
        return usage();
    }
    std::ifstream file(argv[next], std::ios::binary);
    if (!file) {
        std::cerr << argv[next] << ": cannot be read\n";
        return 1;
    }
    const std::string octets{std::istreambuf_iterator<char>(file), {}};
    try {
        const Mif::Component component = Mif::MifReader(tolerances).read(octets);
        for (const Mif::Table& table : component.tables) {
            print(table.name, component.groups[table.group], table.rows);
        }
        for (const Mif::Group& group : component.groups) {
            if (!group.isTemplate()) {
                print(group.name, group, {Mif::Row()});
            }
        }
    } catch (const Mif::Error& error) {
        std::cerr << argv[next] << ":" << error.what() << '\n';
        return 1;
    }
    return 0;
}
