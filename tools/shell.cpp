// SPDX-License-Identifier: MIT
// The tool's shell.
#include "tools/shell.hpp"

#include <exception>
#include <iostream>
#include <new>

#include "tools/steps/place.hpp"
#include "tools/support/failure.hpp"
#include "tools/support/text_layout.hpp"

namespace qz::tools {
namespace {

const ToolHelp& toolHelp() {
  static const ToolHelp help{
      "qz-walkthrough", "Plays and tests scripted walk-throughs over the controls of a window.",
      QZ_VERSION,
      "Exit status:\n"
      "  0  all went well\n"
      "  1  a test failed, a check found something, users would notice a difference, a\n"
      "     walk-through could not start or go on as asked, or a file could not be dumped or\n"
      "     converted\n"
      "  2  bad usage, or a file that is not what it should be\n"
      "  3  a script's lists ran each other endlessly, or a check or a comparison found nothing\n"
      "     but did not see everything"};
  return help;
}

int report(ExitStatus status, const std::string& message) {
  std::cout.flush();
  std::cerr << toolHelp().name << ": " << oneLine(message) << std::endl;
  return static_cast<int>(status);
}

int runReporting(const std::vector<std::string>& arguments,
                 const std::vector<CommandEntry>& commands) {
  try {
    return runCommandLine(toolHelp(), commands, arguments);
  } catch (const steps::SourceRefused& refused) {
    for (const std::string& message : refused.messages()) report(refused.status(), message);
    return static_cast<int>(refused.status());
  } catch (const Failure& failure) {
    return report(failure.status(), failure.what());
  } catch (const std::bad_alloc&) {
    return report(ExitStatus::failed, "there is not enough memory for this");
  } catch (const std::exception& error) {
    return report(ExitStatus::failed, error.what());
  }
}

}  // namespace

int runTool(const std::vector<std::string>& arguments, const std::vector<CommandEntry>& commands) {
  const int result = runReporting(arguments, commands);
  if (!std::cout.flush()) {
    return report(ExitStatus::failed, "standard output cannot be written");
  }
  return result;
}

}  // namespace qz::tools
