#pragma once

// The CIM-XML body of one answer, made while it is sent: little more of it is in memory than is
// read at a time.

#include <Pegasus/Common/Exception.h>

#include <cstddef>
#include <memory>
#include <optional>
#include <string>

#include "protocol/Answer.h"
#include "xml/CimRequest.h"
#include "xml/CimXmlWriter.h"

namespace cimomd {

/// How an operation failed: a status code of DSP0200 and a description in UTF-8.
struct CimStatus {
    unsigned code = 0;
    std::string description;

    static CimStatus of(const Pegasus::CIMException& error);
};

class ResponseStream {
  public:
    /// `trailers`: the client reads the CIM status from HTTP trailers, so failures are left out of
    /// the body.
    ResponseStream(const Pegasus::CimRequest& request, bool trailers);

    /// What the body shall hold; call one of them once, before read.
    void succeed(std::unique_ptr<Answer> operationAnswer) { answer = std::move(operationAnswer); }
    void fail(const CimStatus& status);

    enum class Outcome { Data, End, Broken };

    /// Puts the next bytes, `capacity` unless the answer ends before, into `buffer` and their
    /// number into `count`. Broken: the operation failed after part of the answer was handed over,
    /// to a client without trailers; close the connection.
    Outcome read(char* buffer, std::size_t capacity, std::size_t& count);

    /// After End: the failure to be told in trailers, if any.
    const std::optional<CimStatus>& trailerStatus() const { return trailer; }

  private:
    /// Sees to it that so many bytes are pending, unless the answer ends before.
    void fill(std::size_t wanted);
    void step();
    void finish();

    std::string messageId;
    std::string method;
    Pegasus::CallKind kind;
    bool withTrailers;
    std::unique_ptr<Answer> answer;
    std::optional<CimStatus> trailer;
    std::string pending;
    std::size_t offset = 0;
    bool begun = false;
    bool handedOver = false;
    bool finished = false;
    bool broken = false;
};

}  // namespace cimomd
