// The command `convert`: writes a property list in another format.
#pragma once

namespace CLI {
class App;
}

namespace tools {

/// Adds the command to the tool. It writes the tool's exit status to `status`.
void addConvertCommand(CLI::App& app, int& status);

}  // namespace tools
