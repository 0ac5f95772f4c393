// The least that reads a CIM server's answers.

#pragma once

#include <functional>
#include <string>
#include <string_view>
#include <vector>

#include "bench/programs/LocalSocket.h"

namespace bench {

/// Gets the body of an answer in pieces of 64 KiB at most, as they arrive.
using BodySink = std::function<void(std::string_view piece)>;

/// Asks over one connection. Understands answers in chunks, and no others.
class AnswerReader {
  public:
    /// Throws std::runtime_error as ask does.
    explicit AnswerReader(const std::string& socketPath);

    void ask(std::string_view method, std::string_view className, const BodySink& sink);

  private:
    void receive();
    std::string_view takeLine();
    void passChunk(std::size_t size, const BodySink& sink);

    LocalSocket socket;
    std::vector<char> buffer;
    /// What of the buffer is received and not yet read.
    std::string_view unread;
    std::string line;
};

}  // namespace bench
