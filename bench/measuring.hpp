// SPDX-License-Identifier: MIT
// Contenders take turns in one run, so that other load on the machine affects all of them; the
// shortest time of each counts.
#pragma once

#include <cstddef>
#include <functional>
#include <string>
#include <utility>
#include <vector>

namespace qz::bench {

struct Contender {
  std::string name;
  std::function<void()> run;              ///< measured
  std::function<void()> prepare = [] {};  ///< called before each run, not measured
};

/// Returns the shortest processor time of one run of each contender, in seconds, after `rounds`
/// turns.
std::vector<double> leastTimes(const std::vector<Contender>& contenders, int rounds);

/// Returns the exponent e of the curve time = c·size^e that best fits the points (size, time).
double fittedExponent(const std::vector<std::pair<double, double>>& points);
/// Prints a line with the text `growth` and the fitted exponent.
void printExponent(const std::string& growth, const std::vector<std::pair<double, double>>& points);

/// Returns the processor time of one run, in seconds.
double timeOf(const std::function<void()>& run);

/// The memory that this program holds now, and its peak so far, in bytes.
struct Memory {
  std::size_t now;
  std::size_t most;
};
Memory memory();

/// Runs this program again with the arguments, which must have no special meaning to the shell, and
/// returns the numbers that it prints. Ends the program if that fails.
std::vector<double> numbersOfOwnRun(const std::string& arguments);

/// Prints one row of a Markdown table.
void printRow(const std::vector<std::string>& cells);
/// Prints a title line and the table's head.
void printHead(const std::string& title, const std::vector<std::string>& cells);

/// Formats seconds in a suitable unit, such as "1.25 ms".
std::string shownTime(double seconds);
/// Formats as "2.50 B".
std::string shownBytes(double bytes);
/// Formats as "×2.50".
std::string shownRatio(double ratio);

}  // namespace qz::bench
