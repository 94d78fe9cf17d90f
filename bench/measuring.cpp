#include "bench/measuring.hpp"

#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <cstdio>
#include <ctime>
#include <limits>

namespace bench {
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

std::vector<double> leastTimes(const std::vector<Contender>& contenders, int rounds) {
  std::vector<double> least(contenders.size(), std::numeric_limits<double>::infinity());
  for (int round = 0; round < rounds; ++round) {
    for (std::size_t i = 0; i < contenders.size(); ++i) {
      contenders[i].prepare();
      const double start = processorTime();
      contenders[i].run();
      least[i] = std::min(least[i], processorTime() - start);
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

std::size_t peakMemoryOf(const std::vector<std::string>& arguments) {
  const pid_t child = ::fork();
  if (child == 0) {
    std::vector<std::string> own{"bench"};
    own.insert(own.end(), arguments.begin(), arguments.end());
    std::vector<char*> pointers;
    for (std::string& argument : own) pointers.push_back(argument.data());
    pointers.push_back(nullptr);
    ::execv("/proc/self/exe", pointers.data());
    ::_exit(1);
  }
  int status = 0;
  rusage usage{};
  if (child < 0 || ::wait4(child, &status, 0, &usage) != child || status != 0) return 0;
  return static_cast<std::size_t>(usage.ru_maxrss) * 1024;  // Linux counts it in KiB
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

std::string shownTime(double seconds) {
  if (seconds < 1e-6) return formatted("%.0f ns", 1e9 * seconds);
  if (seconds < 1e-3) return formatted("%.2f µs", 1e6 * seconds);
  if (seconds < 1) return formatted("%.2f ms", 1e3 * seconds);
  return formatted("%.2f s", seconds);
}

std::string shownRatio(double ratio) { return formatted("×%.2f", ratio); }

}  // namespace bench
