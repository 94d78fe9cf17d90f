// SPDX-License-Identifier: MIT
// What the shell reports when a command throws.
#include "tools/shell.hpp"

#include <gtest/gtest.h>

#include <new>
#include <stdexcept>
#include <string>

#include "qz/toolkit/exception.hpp"
#include "tool_run.hpp"
#include "tools/support/failure.hpp"

namespace qz::tools {
namespace {

/// A command that prints "begun" and throws.
template <class Thrown, auto... arguments>
constexpr CommandEntry throwing{"throw", "Throws.", [](Command& command) {
                                  command.action([]() -> int {
                                    std::cout << "begun\n";
                                    throw Thrown(arguments()...);
                                  });
                                }};

ExitStatus badInput() { return ExitStatus::badInput; }
std::string twoLines() { return "two\nlines"; }

TEST(Shell, ReportsWhatACommandThrowsInOneLine) {
  const struct {
    CommandEntry command;
    ExitStatus status;
    const char* line;
  } cases[] = {
      {throwing<Failure, badInput, twoLines>, ExitStatus::badInput, "two\\nlines"},
      {throwing<std::bad_alloc>, ExitStatus::failed, "there is not enough memory for this"},
      {throwing<std::runtime_error, twoLines>, ExitStatus::failed, "two\\nlines"},
      {throwing<toolkit::RangeException, twoLines>, ExitStatus::failed, "two\\nlines"},
  };
  for (const auto& test : cases) {
    const Result result = run(test.command, {"throw"});
    EXPECT_EQ(result.status, static_cast<int>(test.status)) << test.line;
    EXPECT_EQ(result.out, "begun\n");
    EXPECT_EQ(result.err, std::string("qz-walkthrough: ") + test.line + "\n");
  }
}

}  // namespace
}  // namespace qz::tools
