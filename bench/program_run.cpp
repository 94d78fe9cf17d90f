// SPDX-License-Identifier: MIT
#include "bench/program_run.hpp"

#include <sys/resource.h>
#include <sys/wait.h>

#include <array>
#include <chrono>
#include <cstdio>
#include <cstdlib>

namespace qz::bench {
namespace {

double seconds(const timeval& time) {
  return static_cast<double>(time.tv_sec) + 1e-6 * static_cast<double>(time.tv_usec);
}

/// Returns the processor time of all programs that this one ran until now, in seconds.
double processorTimeOfOthers() {
  rusage usage{};
  ::getrusage(RUSAGE_CHILDREN, &usage);
  return seconds(usage.ru_utime) + seconds(usage.ru_stime);
}

std::string contents(std::FILE* file) {
  std::string text;
  std::array<char, 4096> buffer{};
  for (std::size_t count = 1; count > 0; text.append(buffer.data(), count)) {
    count = std::fread(buffer.data(), 1, buffer.size(), file);
  }
  return text;
}

}  // namespace

ProgramRun runProgram(const std::string& commandLine) {
  const double processorBefore = processorTimeOfOthers();
  const auto began = std::chrono::steady_clock::now();
  std::FILE* const output = ::popen(commandLine.c_str(), "r");
  ProgramRun run;
  if (output) run.output = contents(output);
  const int status = output ? ::pclose(output) : -1;
  run.wall = std::chrono::duration<double>(std::chrono::steady_clock::now() - began).count();
  run.processor = processorTimeOfOthers() - processorBefore;
  if (status == -1 || !WIFEXITED(status)) {
    std::fprintf(stderr, "%s failed\n", commandLine.c_str());
    std::exit(1);
  }
  run.status = WEXITSTATUS(status);
  return run;
}

}  // namespace qz::bench
