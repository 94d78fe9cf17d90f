// SPDX-License-Identifier: MIT
#include "tools/storyboard/step_names.hpp"

#include <cstdint>
#include <iomanip>
#include <map>
#include <set>
#include <sstream>

#include "tools/cover/control_names.hpp"
#include "tools/play/words.hpp"
#include "tools/support/text_layout.hpp"

namespace qz::tools::storyboard {
namespace {

using walkthrough::ControlPicture;
using walkthrough::StepPicture;

constexpr std::size_t longestPart = 32;

/// Returns all that a step is, in words.
std::string everythingOf(const BoardStep& step, const StepPicture& picture) {
  std::ostringstream words;
  words << step.group << '\n';
  for (const ControlPicture& control : picture.controls) {
    words << control.view.tag << '\n' << play::contentOf(control) << '\n';
    for (const std::string& remark : play::remarksOn(control)) words << remark << '\n';
  }
  for (const auto& timer : picture.timers) words << timer.key << ' ' << timer.timeLeft << '\n';
  return words.str();
}

/// Returns the text's hash (FNV-1a), which is the same everywhere, in eight hexadecimal digits.
std::string digestOf(const std::string& text) {
  std::uint32_t hash = 2166136261U;
  for (const char c : text) hash = (hash ^ static_cast<std::uint8_t>(c)) * 16777619U;
  std::ostringstream digits;
  digits << std::hex << std::setw(8) << std::setfill('0') << hash;
  return digits.str();
}

struct Difference {
  std::string words{};
  std::string id{};
};

/// Says in a few words what is different in a control; nothing if nothing is that has a word.
std::string wordsFor(const ControlPicture& first, const ControlPicture& other,
                     const std::string& name) {
  if (first.view.hidden && other.view.hidden) return "";
  if (first.view.hidden != other.view.hidden)
    return (first.view.hidden ? "with " : "without ") + name;
  const std::string content = play::contentOf(other);
  if (play::contentOf(first) != content) {
    return quote(firstCharacters(content.substr(0, content.find('\n')), longestPart));
  }
  if (first.view.enabled != other.view.enabled) {
    return name + (other.view.enabled ? " enabled" : " disabled");
  }
  if (first.view.state == other.view.state) return "";
  return name + " " + std::string(play::stateWord(other.view.state));
}

Difference differenceBetween(const StepPicture& first, const StepPicture& other) {
  const auto names = cover::controlNames(first);
  for (std::size_t i = 0; i < other.controls.size(); ++i) {
    const auto words = wordsFor(first.controls[i], other.controls[i], names[i]);
    if (!words.empty()) return {words, cover::slugOf(words, longestPart)};
  }
  return {};
}

class Namer {
 public:
  explicit Namer(bool hasNames) : hasNames_(hasNames) {}

  StepName nameOf(const BoardStep& step, const StepPicture& picture) {
    const auto [first, isFirst] = firsts_.try_emplace(step.group, &picture);
    const std::string title = hasNames_ ? step.group : "List " + step.group;
    const std::string slug = cover::slugOf(title, longestPart);
    const std::string id = slug.empty() ? digestOf(title) : slug;
    if (isFirst && taken_.insert(id).second) return {id, title};
    const auto difference =
        step.isOver ? Difference{"the end", "the-end"} : differenceBetween(*first->second, picture);
    const std::string longer = difference.id.empty() ? id : id + "-" + difference.id;
    const bool isFree = !difference.id.empty() && taken_.insert(longer).second;
    return {isFree ? longer : freeId(longer + "-" + digestOf(everythingOf(step, picture))),
            difference.words.empty() ? title : title + ": " + difference.words};
  }

 private:
  /// Numbers only what nobody can tell apart.
  std::string freeId(const std::string& wanted) {
    std::string id = wanted;
    for (int number = 2; !taken_.insert(id).second; ++number) {
      id = wanted + "-" + std::to_string(number);
    }
    return id;
  }

  bool hasNames_;
  std::map<std::string, const StepPicture*> firsts_;  // by group
  std::set<std::string> taken_;
};

}  // namespace

std::vector<StepName> stepNames(const std::vector<BoardStep>& steps,
                                const std::vector<StepPicture>& pictures, bool hasNames) {
  Namer namer(hasNames);
  std::vector<StepName> names;
  for (std::size_t i = 0; i < steps.size(); ++i) {
    names.push_back(namer.nameOf(steps[i], pictures[i]));
  }
  return names;
}

}  // namespace qz::tools::storyboard
