// What an HTTP answer says beside its body: status line, header and trailer fields, put together
// line by line as they arrive.

#pragma once

#include <cstddef>
#include <string>
#include <string_view>

#include "client/HttpFields.h"

namespace Pegasus {

class HttpAnswer {
  public:
    /// `octetLimit` bounds header and trailer lines together.
    explicit HttpAnswer(std::size_t octetLimit) : octetsLeft(octetLimit) {}

    /// The next line, with or without its line end. Interim answers (status 1xx) are dropped.
    /// Throws CIMClientMalformedHTTPException when the line is malformed, the limit is passed or
    /// the header gives two different lengths.
    void addLine(std::string_view line);

    /// Whether the empty line after the header has come.
    bool isHeadComplete() const { return headComplete; }
    /// The three digits of the status line; 0 before it has come.
    int status() const { return status_; }
    /// The status line without its line end.
    const std::string& statusLine() const { return statusLine_; }
    const HttpFields& header() const { return header_; }
    /// Complete only after the end of the body.
    const HttpFields& trailer() const { return trailer_; }

  private:
    void setStatusLine(std::string_view line);
    void endHead();

    std::size_t octetsLeft;
    bool headComplete = false;
    int status_ = 0;
    std::string statusLine_;
    HttpFields header_;
    HttpFields trailer_;
};

}  // namespace Pegasus
