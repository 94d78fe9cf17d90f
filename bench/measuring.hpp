// SPDX-License-Identifier: MIT
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
/// A line that says what grows, with what, and the fitted exponent.
void printExponent(const std::string& growth, const std::vector<std::pair<double, double>>& points);

/// The processor time of one run, in seconds.
double timeOf(const std::function<void()>& run);

/// The memory that this program holds now, and the most that it has held, in bytes.
struct Memory {
  std::size_t now;
  std::size_t most;
};
Memory memory();

/// The numbers that this program prints when it is run anew with the arguments, which no shell
/// treats specially. Ends the program where that fails.
std::vector<double> numbersOfOwnRun(const std::string& arguments);

/// One row of a Markdown table.
void printRow(const std::vector<std::string>& cells);
/// The table's head, below a line with its title.
void printHead(const std::string& title, const std::vector<std::string>& cells);

/// Seconds in the unit that suits, such as "1.25 ms".
std::string shownTime(double seconds);
/// "2.50 B".
std::string shownBytes(double bytes);
/// "×2.50".
std::string shownRatio(double ratio);

}  // namespace bench
