// Runs code in a child process, for what a test must not do to itself: environment, limits, user.
#pragma once

#include <functional>
#include <string>

// Runs `body` in a forked child and returns what it returned. A child that ends otherwise gives
// "child failed".
std::string runInChild(const std::function<std::string()>& body);
