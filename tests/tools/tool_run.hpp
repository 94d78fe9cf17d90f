// SPDX-License-Identifier: MIT
// Runs the tool's commands in the test's own process.
#pragma once

#include <iostream>
#include <sstream>
#include <string>
#include <vector>

#include "tools/shell.hpp"

namespace qz::tools {

/// Captures the output to a standard stream while this object lives.
class Captured {
 public:
  explicit Captured(std::ostream& stream) : stream_(stream), before_(stream.rdbuf(text_.rdbuf())) {}
  ~Captured() { stream_.rdbuf(before_); }
  Captured(const Captured&) = delete;
  Captured& operator=(const Captured&) = delete;

  std::string text() const { return text_.str(); }

 private:
  std::ostringstream text_;
  std::ostream& stream_;
  std::streambuf* before_;
};

struct Result {
  int status;
  std::string out;
  std::string err;
};

/// Runs the tool with only this command.
inline Result run(const CommandEntry& command, const std::vector<std::string>& arguments) {
  const Captured out(std::cout);
  const Captured err(std::cerr);
  const int status = runTool(arguments, {command});
  return {status, out.text(), err.text()};
}

}  // namespace qz::tools
