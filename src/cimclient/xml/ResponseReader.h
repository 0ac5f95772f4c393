// Reads what encloses the result of an operation in the server's answer, and its ERROR.

#pragma once

#include <Pegasus/Common/Config.h>
#include <Pegasus/Common/String.h>

#include <functional>
#include <optional>
#include <string>
#include <string_view>

#include "xml/ByteSource.h"
#include "xml/DecodeContext.h"
#include "xml/ElementReader.h"
#include "xml/NameCache.h"
#include "xml/XmlError.h"

namespace Pegasus {

/// One answer: from CIM down to IMETHODRESPONSE. What is inside IRETURNVALUE is the caller's.
class ResponseReader {
  public:
    /// The source must outlive the response reader.
    explicit ResponseReader(ByteSource& source) : reader(source), context(names) {}

    /// For whoever reads the result.
    ElementReader& elements() { return reader; }
    DecodeContext& decodeContext() { return context; }

    /// Reads the whole answer to the request `messageId` of `method`. When there is an
    /// IRETURNVALUE, `readResult` is called inside it and must leave it. Throws the exceptions of
    /// the client.
    void read(std::string_view messageId, std::string_view method,
              const std::function<void()>& readResult);

  private:
    struct Status {
        Uint32 code;
        String description;
    };

    void readMessage(std::string_view messageId, std::string_view method,
                     const std::function<void()>& readResult);
    void readMethodResponse(const std::function<void()>& readResult);
    Status readError();
    [[noreturn]] void throwForClient(const XmlError& error) const;

    ElementReader reader;
    NameCache names;
    DecodeContext context;
    std::optional<Status> status;
};

}  // namespace Pegasus
