// A CIM answer that only has to be sent.

#pragma once

#include <cstddef>
#include <string>
#include <string_view>

namespace bench {

/// An answer in HTTP chunks. What depends on the request, its message identifier, is in a chunk of
/// its own, made when the answer is asked for.
class ReadyAnswer {
  public:
    explicit ReadyAnswer(std::string method) : method(std::move(method)) {}

    /// More of the result, in any pieces.
    void append(std::string_view xml);
    /// No more of it.
    void finish();

    /// The head of the HTTP answer and the first chunk.
    std::string beginning(std::string_view messageId) const;
    /// All the rest, once finished.
    std::string_view rest() const { return chunks; }

  private:
    void writeChunk(std::size_t size);

    std::string method;
    std::string pending;
    std::string chunks;
};

}  // namespace bench
