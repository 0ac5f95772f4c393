// The fields of an HTTP header or trailer section (RFC 9110, section 5).

#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace Pegasus {

class HttpFields {
  public:
    /// Takes one line without its line end; a line that begins with a blank continues the one
    /// before. Throws CIMClientMalformedHTTPException when it is no field.
    void addLine(std::string_view line);
    void clear() { fields.clear(); }

    /// The value of the first field of that name (in any case) without blanks around it, or
    /// nullptr. Valid until the fields change.
    const std::string* find(std::string_view name) const;
    /// The values of all fields of that name, in their order; see find().
    std::vector<const std::string*> findAll(std::string_view name) const;

  private:
    struct Field {
        std::string name;
        std::string value;
    };

    std::vector<Field> fields;
};

}  // namespace Pegasus
