// The command `play`: plays a script in the terminal.
#pragma once

namespace CLI {
class App;
}

namespace tools {

/// Adds the command to the tool. It writes the tool's exit status to `status`.
void addPlayCommand(CLI::App& app, int& status);

}  // namespace tools
