// SPDX-License-Identifier: MIT
// What the commands of a script did in all their runs, and what is wrong with that.
#pragma once

#include <cstddef>
#include <map>
#include <optional>
#include <set>
#include <string>
#include <vector>

#include "tests/check/finding.hpp"
#include "tests/check/script_reading.hpp"
#include "tests/check/trace.hpp"

namespace qz::naive {

class CommandFacts {
 public:
  /// `kinds` are those of the window's controls, back to front.
  CommandFacts(Script script, std::vector<drivers::ViewKind> kinds);

  /// Takes note of what a move did, at the end of a path of so many moves.
  void note(const Trace& trace, std::size_t pathLength);

  /// Adds the findings. If not everything was explored, only those that no other run can refute.
  void report(bool complete, Findings& findings) const;

 private:
  /// How often something happened, and the shortest path to it.
  struct Count {
    std::size_t times = 0;
    std::size_t pathLength = 0;

    void add(std::size_t length) {
      if (times++ == 0 || length < pathLength) pathLength = length;
    }
  };
  struct Element {
    std::optional<toolkit::Tag> tag;
    Count found, notFound, wrongKind, refused, accepted;
  };

  void note(const CommandRun& run, std::size_t pathLength);
  void noteSearch(const CommandRun& run, Element& element, std::size_t pathLength) const;
  void reportElement(const Site& site, const Element& element, bool complete,
                     Findings& findings) const;
  void reportTimers(Findings& findings) const;
  void reportLists(Findings& findings) const;

  Script script_;
  std::vector<drivers::ViewKind> kinds_;
  std::map<Site, Element> elements_;
  Findings known_;  // those that other runs cannot refute
  std::set<std::string> lists_;
  std::map<TimerStart, Count> started_;
  std::set<Site> fired_;
  std::set<Site> beaten_;
};

}  // namespace qz::naive
