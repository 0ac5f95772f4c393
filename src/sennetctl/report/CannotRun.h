#pragma once

// The exception that ends a command.

#include <memory>
#include <stdexcept>
#include <string>

#include "report/Failure.h"

namespace sennetctl {

/// A command cannot do its work.
class CannotRun : public std::runtime_error {
  public:
    explicit CannotRun(const Failure& failure)
        : std::runtime_error(textOf(failure)), told(std::make_shared<const Failure>(failure)) {}
    explicit CannotRun(const std::string& reason) : CannotRun(Failure{{}, 0, 0, reason}) {}
    CannotRun(const std::string& file, const std::string& reason)
        : CannotRun(Failure{file, 0, 0, reason}) {}

    const Failure& failure() const { return *told; }

  private:
    std::shared_ptr<const Failure> told;  // a copy of an exception must not throw
};

}  // namespace sennetctl
