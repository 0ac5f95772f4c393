// An operation as a server receives it: one method call of DSP0200.

#pragma once

#include <Pegasus/Common/Array.h>
#include <Pegasus/Common/CIMName.h>
#include <Pegasus/Common/CIMObjectPath.h>
#include <Pegasus/Common/CIMPropertyList.h>
#include <Pegasus/Common/Config.h>
#include <Pegasus/Common/String.h>

#include <initializer_list>
#include <string>
#include <string_view>
#include <variant>
#include <vector>

#include "xml/ByteSource.h"
#include "xml/CimRequestError.h"

namespace Pegasus {

/// An IPARAMVALUE that was read but whose kind no reading operation uses (CLASS, INSTANCE, ...).
struct UnreadParameter {};

/// One parameter. std::monostate is null: an IPARAMVALUE without a value.
struct CimParameter {
    using Value = std::variant<std::monostate, String, Array<String>, CIMName, CIMObjectPath,
                               UnreadParameter>;
    std::string name;
    Value value;
};

/// The getters look parameters up by name, ignoring case. They throw CIMException with code 4
/// (CIM_ERR_INVALID_PARAMETER) when the parameter was given twice or has a value of another kind.
class CimRequest {
  public:
    /// As it was sent; send it back in the answer.
    std::string messageId;
    /// For example "GetClass", in the client's spelling.
    std::string method;
    /// A method of a class or an instance (METHODCALL), whose parameters are not kept.
    Boolean isExtrinsic = false;
    /// The parts of LOCALNAMESPACEPATH, joined by "/"; never null.
    CIMNamespaceName nameSpace;
    std::vector<CimParameter> parameters;

    /// `fallback` when the parameter is absent or null. TRUE and FALSE in any case.
    Boolean flag(std::string_view name, Boolean fallback) const;

    /// A class name; null when the parameter is absent or null.
    CIMName className(std::string_view name) const;

    /// An instance name; one with a null class name when the parameter is absent or null.
    CIMObjectPath instanceName(std::string_view name) const;

    /// A list of property names; the null list when the parameter is absent or null. Texts that are
    /// no property names are left out: they cannot name anything.
    CIMPropertyList propertyList(std::string_view name) const;

    /// A text; null when the parameter is absent or null.
    const String* text(std::string_view name) const;

    /// Throws CIMException with code 4 when a parameter is not among `known` or was given twice.
    void requireOnly(std::initializer_list<std::string_view> known) const;

  private:
    const CimParameter* find(std::string_view name) const;
    template <typename T>
    const T* valueOf(std::string_view name, const char* expected) const;
};

/// Reads one request up to the end of `source`. Throws CimRequestError, and what `source` throws.
CimRequest decodeRequest(ByteSource& source);

}  // namespace Pegasus
