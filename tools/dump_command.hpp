// The command `dump`: prints a property list.
#pragma once

namespace CLI {
class App;
}

namespace tools {

/// Adds the command to the tool. It writes the tool's exit status to `status`.
void addDumpCommand(CLI::App& app, int& status);

}  // namespace tools
