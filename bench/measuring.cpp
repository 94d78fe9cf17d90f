// SPDX-License-Identifier: MIT
#include "bench/measuring.hpp"

#include <algorithm>
#include <array>
#include <cmath>
#include <cstdio>
#include <cstdlib>
#include <ctime>
#include <filesystem>
#include <fstream>
#include <limits>

namespace qz::bench {
namespace {

double processorTime() {
  timespec now{};
  ::clock_gettime(CLOCK_PROCESS_CPUTIME_ID, &now);
  return static_cast<double>(now.tv_sec) + 1e-9 * static_cast<double>(now.tv_nsec);
}

std::string formatted(const char* format, double number) {
  std::array<char, 32> text{};
  std::snprintf(text.data(), text.size(), format, number);
  return text.data();
}

}  // namespace

double timeOf(const std::function<void()>& run) {
  const double start = processorTime();
  run();
  return processorTime() - start;
}

std::vector<double> leastTimes(const std::vector<Contender>& contenders, int rounds) {
  std::vector<double> least(contenders.size(), std::numeric_limits<double>::infinity());
  for (int round = 0; round < rounds; ++round) {
    for (std::size_t i = 0; i < contenders.size(); ++i) {
      contenders[i].prepare();
      least[i] = std::min(least[i], timeOf(contenders[i].run));
    }
  }
  return least;
}

double fittedExponent(const std::vector<std::pair<double, double>>& points) {
  double sumX = 0, sumY = 0, sumXX = 0, sumXY = 0;
  for (const auto& [size, time] : points) {
    const double x = std::log(size), y = std::log(time);
    sumX += x;
    sumY += y;
    sumXX += x * x;
    sumXY += x * y;
  }
  const auto count = static_cast<double>(points.size());
  return (count * sumXY - sumX * sumY) / (count * sumXX - sumX * sumX);
}

Memory memory() {
  Memory memory{};
  std::ifstream status("/proc/self/status");
  for (std::string name; status >> name; status.ignore(256, '\n')) {
    if (name == "VmRSS:") status >> memory.now;
    if (name == "VmHWM:") status >> memory.most;
  }
  return {memory.now * 1024, memory.most * 1024};  // Linux counts in KiB
}

std::vector<double> numbersOfOwnRun(const std::string& arguments) {
  const std::string program = std::filesystem::read_symlink("/proc/self/exe").string();
  std::FILE* const output = ::popen(("'" + program + "' " + arguments).c_str(), "r");
  std::vector<double> numbers;
  for (double number = 0; output && std::fscanf(output, "%lf", &number) == 1;) {
    numbers.push_back(number);
  }
  if (output && ::pclose(output) == 0) return numbers;
  std::fprintf(stderr, "%s %s failed\n", program.c_str(), arguments.c_str());
  std::exit(1);
}

void printRow(const std::vector<std::string>& cells) {
  std::string line = "|";
  for (const std::string& cell : cells) line += " " + cell + " |";
  std::puts(line.c_str());
  std::fflush(stdout);
}

void printHead(const std::string& title, const std::vector<std::string>& cells) {
  std::printf("\n%s\n\n", title.c_str());
  printRow(cells);
  std::vector<std::string> rule(cells.size(), "---:");
  rule.front() = "---";
  printRow(rule);
}

void printExponent(const std::string& growth,
                   const std::vector<std::pair<double, double>>& points) {
  std::printf("\n%s to the power of %.3f.\n", growth.c_str(), fittedExponent(points));
}

std::string shownTime(double seconds) {
  if (seconds < 1e-8) return formatted("%.2f ns", 1e9 * seconds);
  if (seconds < 1e-6) return formatted("%.0f ns", 1e9 * seconds);
  if (seconds < 1e-3) return formatted("%.2f µs", 1e6 * seconds);
  if (seconds < 1) return formatted("%.2f ms", 1e3 * seconds);
  return formatted("%.2f s", seconds);
}

std::string shownBytes(double bytes) { return formatted("%.2f B", bytes); }

std::string shownRatio(double ratio) { return formatted("×%.2f", ratio); }

}  // namespace qz::bench
