#pragma once

// What the tests of the client have in common.

#include <Pegasus/Common/Exception.h>
#include <Pegasus/Common/String.h>
#include <gtest/gtest.h>

#include <chrono>
#include <string>

namespace testing_client {

inline std::string text(const Pegasus::String& string) {
    return static_cast<const char*>(string.getCString());
}

// Runs what must raise an E and returns its message; a failure of the test otherwise.
template <typename E, typename Action>
std::string messageOf(Action action) {
    try {
        action();
    } catch (const E& exception) {
        return text(exception.getMessage());
    } catch (const Pegasus::Exception& exception) {
        ADD_FAILURE() << "another exception: " << text(exception.getMessage());
        return "";
    }
    ADD_FAILURE() << "no exception";
    return "";
}

class Stopwatch {
  public:
    long milliseconds() const {
        return static_cast<long>(std::chrono::duration_cast<std::chrono::milliseconds>(
                                     std::chrono::steady_clock::now() - start)
                                     .count());
    }

  private:
    std::chrono::steady_clock::time_point start = std::chrono::steady_clock::now();
};

}  // namespace testing_client
