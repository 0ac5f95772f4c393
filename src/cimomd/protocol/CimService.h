#pragma once

// CIM operations over HTTP (DSP0200): which requests are taken, and what status and headers the
// answers carry.

#include <optional>
#include <string>
#include <string_view>

#include "protocol/Dispatcher.h"
#include "protocol/HttpMessages.h"

namespace cimomd {

class CimService {
  public:
    /// Larger request bodies are refused.
    static constexpr std::size_t kMaxBodyBytes = std::size_t{1} << 20;

    /// `operations` must outlive the service.
    explicit CimService(const Dispatcher& operations) : dispatcher(operations) {}

    /// The refusal of a request by its head alone; nothing when the body is worth reading.
    std::optional<HttpAnswer> refusalOf(const HttpHead& head) const;

    /// The answer to a request whose head was not refused. Never raises for what is in the body.
    HttpAnswer answer(const HttpHead& head, std::string_view body) const;

    static HttpAnswer bodyTooLarge();

  private:
    const Dispatcher& dispatcher;
};

}  // namespace cimomd
