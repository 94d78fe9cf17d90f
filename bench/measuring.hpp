// Measuring: contenders take turns in one run, so that whatever else the machine does meets all of
// them, and the shortest time of each counts.
#pragma once

#include <cstddef>
#include <functional>
#include <string>
#include <utility>
#include <vector>

namespace bench {

struct Contender {
  std::string name;
  std::function<void()> run;              ///< what is measured
  std::function<void()> prepare = [] {};  ///< before each run, not measured
};

/// The least processor time of one run of each contender, in seconds, after `rounds` turns.
std::vector<double> leastTimes(const std::vector<Contender>& contenders, int rounds);

/// The exponent e of time = c·size^e that fits the points (size, time) best.
double fittedExponent(const std::vector<std::pair<double, double>>& points);

/// The most memory that this program held when run anew with these arguments, in bytes. Zero where
/// it failed.
std::size_t peakMemoryOf(const std::vector<std::string>& arguments);

/// One row of a Markdown table.
void printRow(const std::vector<std::string>& cells);
/// The table's head, below a line with its title.
void printHead(const std::string& title, const std::vector<std::string>& cells);

/// Seconds in the unit that suits, such as "1.25 ms".
std::string shownTime(double seconds);
/// "×2.50".
std::string shownRatio(double ratio);

}  // namespace bench
