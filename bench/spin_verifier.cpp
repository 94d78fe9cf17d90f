// SPDX-License-Identifier: MIT
#include "bench/spin_verifier.hpp"

#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <string>

#include "bench/program_run.hpp"

namespace qz::bench {
namespace {

[[noreturn]] void fail(const std::string& message) {
  std::fprintf(stderr, "bench-checking: %s\n", message.c_str());
  std::exit(1);
}

/// Returns the model: a bit for each button says whether its field is shown, and one process
/// switches any of them, again and again.
std::string model(std::size_t buttons) {
  std::string bits, choices;
  for (std::size_t i = 0; i < buttons; ++i) {
    const std::string bit = "shown" + std::to_string(i);
    bits += "bit " + bit + ";\n";
    choices += "  :: " + bit + " = 1 - " + bit + "\n";
  }
  return bits + "active proctype user() {\n  do\n" + choices + "  od\n}\n";
}

std::filesystem::path makeDirectory() {
  std::string name = (std::filesystem::temp_directory_path() / "bench-checking-XXXXXX").string();
  if (!::mkdtemp(name.data())) fail("cannot make a directory for the verifier");
  return name;
}

/// Returns the number in front of a text of the verifier's report.
std::size_t numberBefore(const std::string& report, const std::string& text) {
  const std::size_t end = report.find(text);
  if (end == std::string::npos) fail("the verifier of SPIN reports no “" + text + "”:\n" + report);
  const std::size_t line = report.rfind('\n', end) + 1;
  return static_cast<std::size_t>(std::strtod(report.c_str() + line, nullptr));
}

}  // namespace

SpinVerifier::SpinVerifier(std::size_t buttons) : buttons_(buttons), directory_(makeDirectory()) {
  std::ofstream(directory_ / "model.pml") << model(buttons);
  // Presses commute, so SPIN could leave most orders out: NOREDUCE makes it go through all of them.
  const auto built = runProgram("cd '" + directory_.string() +
                                "' && spin -a model.pml && "
                                "gcc -O2 -DSAFETY -DNOREDUCE -DMEMLIM=16000 -w -o pan pan.c");
  if (built.status != 0) fail("SPIN's verifier cannot be built:\n" + built.output);
}

SpinVerifier::~SpinVerifier() {
  std::error_code ignored;
  std::filesystem::remove_all(directory_, ignored);
}

Verification SpinVerifier::run() const {
  // The search may go as deep as there are states, and the hash table has two slots for each state.
  const std::string depth = std::to_string((std::size_t{1} << buttons_) + 10);
  const auto run = runProgram("cd '" + directory_.string() + "' && exec ./pan -m" + depth + " -w" +
                              std::to_string(buttons_ + 1));
  const std::string& report = run.output;
  if (run.status != 0 || report.find("errors: 0") == std::string::npos ||
      report.find("max search depth too small") != std::string::npos) {
    fail("SPIN's verifier did not finish:\n" + report);
  }
  return {numberBefore(report, " states, stored"), numberBefore(report, " transitions"),
          run.processor};
}

}  // namespace qz::bench
