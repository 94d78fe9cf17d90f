// The command `test`: runs scenarios.
#pragma once

#include <iosfwd>
#include <optional>
#include <string>
#include <vector>

namespace CLI {
class App;
}

namespace tools {

struct TestOptions {
  std::vector<std::string> paths;  ///< scenario files, and directories that hold some
  std::string toolkit = "memory";
  std::string filter;  ///< run only scenarios whose title contains this
  bool list = false;   ///< name the scenarios instead of running them
  bool verbose = false;
  std::optional<std::string> junit;  ///< where to write a report
};

/// Runs the scenarios and writes their failures and the counts to `out`, and to `problems` what
/// makes a file no scenario. Gives the tool's exit status. Throws a Failure when a report cannot be
/// written or there is no such toolkit.
int runTests(const TestOptions& options, std::ostream& out, std::ostream& problems);

/// Adds the command to the tool. It writes the tool's exit status to `status`.
void addTestCommand(CLI::App& app, int& status);

}  // namespace tools
