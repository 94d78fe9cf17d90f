// SPDX-License-Identifier: MIT
// The check and the second opinion agree on generated scripts: on every place, on the number of
// moves, on every finding that needs exploring, and on the length of each shortest path.

#include <gtest/gtest.h>

#include <cstdlib>
#include <map>
#include <sstream>
#include <string>
#include <tuple>

#include "tests/check/checking.hpp"
#include "tests/check/generated_scripts.hpp"
#include "tests/check/naive_explorer.hpp"
#include "tools/check/conclusions.hpp"
#include "tools/check/look_conclusions.hpp"
#include "tools/check/reading.hpp"
#include "tools/walkthrough/parse_number.hpp"

namespace qz::tools::check {
namespace {

constexpr std::size_t mostPlaces = 300;  // more take the second opinion too long

// Environment variables choose other scripts, and more of them.
std::uint64_t fromEnvironment(const char* name, std::uint64_t otherwise) {
  const char* const text = std::getenv(name);
  return text ? std::strtoull(text, nullptr, 10) : otherwise;
}

/// A finding as both name it: code, list, element, tag.
using Cause = std::tuple<std::string, std::string, std::size_t, toolkit::Tag>;

std::string words(const std::map<Cause, std::size_t>& findings) {
  std::ostringstream text;
  for (const auto& [cause, length] : findings) {
    const auto& [code, list, element, tag] = cause;
    text << "  " << code << " list " << list << " element " << static_cast<long>(element) << " tag "
         << tag << ": " << length << " moves\n";
  }
  return text.str();
}

constexpr std::size_t noElement = static_cast<std::size_t>(-1);

/// Adds a finding. Several controls may have had the tag before the start: the shortest path
/// counts.
void add(const Cause& cause, std::size_t length, std::map<Cause, std::size_t>& findings) {
  std::size_t& known = findings.try_emplace(cause, length).first->second;
  known = std::min(known, length);
}

struct Opinion {
  std::set<std::string> places;
  std::size_t presses = 0;
  std::size_t waits = 0;
  std::map<Cause, std::size_t> findings;  // with the lengths of their paths
};

/// Writes a place as the second opinion does.
std::string wordsOf(const Exploration& exploration, std::uint32_t number) {
  const auto& format = exploration.format();
  const auto* const place = exploration.place(number);
  const bool isOver = format.isOver(place);
  std::string text;
  for (std::size_t i = 0; i < format.controls(); ++i) {
    const ControlState state = format.control(place, i);
    text += std::string(drivers::rowOf(exploration.setting().kinds[i]).name) + ":" +
            std::to_string(state.tag) + (state.hidden ? ":hidden" : ":shown") +
            (state.enabled ? ":enabled;" : ":disabled;");
  }
  text += isOver ? "window:gone:free;timers:" : "window:shown:free;timers:";
  bool isFirst = true;
  for (const PendingTimer& timer : exploration.timers(number)) {
    char seconds[64];
    std::snprintf(seconds, sizeof seconds, "%.6f", timer.seconds);
    text += (isFirst ? "" : ",") + timer.key + "@" + seconds;
    isFirst = false;
  }
  return text + (isOver ? ";script:no;ended:yes" : ";script:yes;ended:no");
}

Opinion ours(const naive::Generated& generated, const std::vector<std::string>& keys) {
  const Script script(generated.script);
  walkthrough::StagePlan plan;
  plan.host = generated.host;
  Setting setting = settingOf(script, plan, "/");
  const auto explored = explore(setting, keys, {}, 1, {});
  Exploration& exploration = *explored;
  Opinion opinion{
      .places = {}, .presses = exploration.presses(), .waits = exploration.waits(), .findings = {}};
  for (std::uint32_t i = 0; i < exploration.places(); ++i) {
    opinion.places.insert(wordsOf(exploration, i));
  }
  drivers::MemoryDriver driver;
  auto all = conclude(exploration, readScript(script, driver.toolkit()), false, 1);
  const auto looks = concludeFromLooks(exploration, {});
  all.insert(all.end(), looks.begin(), looks.end());
  for (const Finding& each : all) {
    add({each.code, each.list.value_or(""), each.element.value_or(noElement), each.tag.value_or(0)},
        each.path.size(), opinion.findings);
  }
  return opinion;
}

bool wordIsTag(const std::string& key) {
  const auto tag = walkthrough::parseNumber<toolkit::Tag>(key);
  return tag && std::to_string(*tag) == key;
}

std::string smallestKey(const Script& script) {
  const ScriptList* smallest = nullptr;
  for (const ScriptList& list : script.lists()) {
    if (list.tag && (!smallest || *list.tag < *smallest->tag)) smallest = &list;
  }
  return smallest ? smallest->key : "";
}

/// Whether both report it: one cause is reported once, and the second opinion reports two.
bool counts(const naive::Finding& finding, const naive::Exploration& all) {
  if (finding.code == "never-runs") return wordIsTag(finding.list);  // else it is an odd key
  if (finding.code != "raises") return true;
  return std::none_of(all.findings.begin(), all.findings.end(), [&](const naive::Finding& each) {
    return each.code == "wrong-target" && each.list == finding.list &&
           each.element == finding.element;
  });
}

TEST(Agreement, OnGeneratedScripts) {
  const std::uint64_t first = fromEnvironment("QZ_FIRST_SEED", 1);
  const std::uint64_t count = fromEnvironment("QZ_SCRIPTS", 200);
  std::size_t disagreements = 0;
  for (std::uint64_t seed = first; seed < first + count && disagreements < 10; ++seed) {
    const naive::Generated generated = naive::generate(seed);
    const std::vector<std::string> keys{smallestKey(Script(generated.script))};
    if (keys.front().empty()) continue;
    const auto theirs = naive::explore(generated.script, generated.host, keys, mostPlaces);
    if (!theirs.complete) continue;
    const Opinion own = ours(generated, keys);
    std::map<Cause, std::size_t> others;
    for (const naive::Finding& each : theirs.findings) {
      if (!counts(each, theirs)) continue;
      add({each.code, each.list, each.element.value_or(noElement), each.tag.value_or(0)},
          each.pathLength, others);
    }
    EXPECT_EQ(own.places, theirs.places) << "seed " << seed;
    EXPECT_EQ(own.presses, theirs.presses) << "seed " << seed;
    EXPECT_EQ(own.waits, theirs.waits) << "seed " << seed;
    if (own.findings == others) continue;
    ++disagreements;
    ADD_FAILURE() << "seed " << seed << "\n"
                  << generated.script->description() << "\nours:\n"
                  << words(own.findings) << "second opinion:\n"
                  << words(others);
  }
}

}  // namespace
}  // namespace qz::tools::check
