#include "client/HttpFields.h"

#include <Pegasus/Client/ClientExceptions.h>

#include <algorithm>

#include "client/WireText.h"

namespace Pegasus {

void HttpFields::addLine(std::string_view line) {
    const bool continues = !line.empty() && (line.front() == ' ' || line.front() == '\t');
    if (continues && !fields.empty()) {
        fields.back().value.append(" ").append(trimmed(line));
        return;
    }
    const std::size_t colon = line.find(':');
    if (continues || colon == 0 || colon == std::string_view::npos) {
        throw CIMClientMalformedHTTPException(printableText(
            "HTTP header line \"" + std::string(line) + "\" is not of the form name: value"));
    }
    fields.push_back(
        Field{std::string(line.substr(0, colon)), std::string(trimmed(line.substr(colon + 1)))});
}

const std::string* HttpFields::find(std::string_view name) const {
    const auto found = std::find_if(fields.begin(), fields.end(), [&](const Field& field) {
        return equalIgnoringCase(field.name, name);
    });
    return found == fields.end() ? nullptr : &found->value;
}

std::vector<const std::string*> HttpFields::findAll(std::string_view name) const {
    std::vector<const std::string*> values;
    for (const Field& field : fields) {
        if (equalIgnoringCase(field.name, name)) {
            values.push_back(&field.value);
        }
    }
    return values;
}

}  // namespace Pegasus
