// SPDX-License-Identifier: MIT
#include "tools/check/expectations.hpp"

#include <algorithm>
#include <iterator>
#include <string_view>

#include "tools/check/lines.hpp"
#include "tools/support/failure.hpp"
#include "tools/support/suggestions.hpp"
#include "tools/support/text_layout.hpp"
#include "tools/walkthrough/parse_number.hpp"

namespace qz::tools::check {
namespace {

using Kind = Condition::Kind;
using Rule = Expectation::Rule;

/// What follows the word that begins a condition.
enum class Operands : std::uint8_t { key, step, control, controlAndWord };

struct KindRow {
  std::string_view word;
  Kind kind;
  Operands operands;
  bool isLook = false;
};

// "the end" has two words and no operand, so it is not a row.
constexpr KindRow kindRows[] = {
    {"list", Kind::listRan, Operands::key},
    {"step", Kind::listRan, Operands::step},
    {"hidden", Kind::hidden, Operands::control},
    {"shown", Kind::shown, Operands::control},
    {"enabled", Kind::enabled, Operands::control},
    {"disabled", Kind::disabled, Operands::control},
    {"on", Kind::on, Operands::control, true},
    {"off", Kind::off, Operands::control, true},
    {"text", Kind::text, Operands::controlAndWord, true},
    {"title", Kind::title, Operands::controlAndWord, true},
    {"image", Kind::image, Operands::controlAndWord, true},
    {"tooltip", Kind::toolTip, Operands::controlAndWord, true},
    {"timer", Kind::timer, Operands::key},
};

constexpr const char* ruleWords =
    "\"can reach\", \"always can reach\", \"always\", \"never\", \"whenever\" or \"within\"";

class Parser {
 public:
  Parser(const Line& line, FileLine place, const Script& script, const walkthrough::Names& names)
      : line_(line), place_(std::move(place)), script_(script), names_(names) {}

  Expectation parse() {
    Expectation expectation{.words = line_.text, .place = place_};
    expectation.rule = takeRule();
    if (expectation.rule == Rule::within) {
      expectation.moves = takeNumber<std::size_t>("a number of moves");
      if (!takes("moves") && !takes("move")) wrong("\"moves\"");
    }
    expectation.condition = takeCondition();
    if (expectation.rule == Rule::whenever) {
      takes(",");
      expectation.consequence = takeCondition();
    }
    if (next_ < line_.words.size()) wrong("the end of the line");
    return expectation;
  }

 private:
  Rule takeRule() {
    if (takes("whenever")) return Rule::whenever;
    if (takes("within")) return Rule::within;
    if (takes("never")) return Rule::never;
    const bool isAlways = takes("always");
    if (takes("can")) {
      if (!takes("reach")) wrong("\"reach\"");
      return isAlways ? Rule::alwaysCanReach : Rule::canReach;
    }
    if (!isAlways) wrong(ruleWords);
    return Rule::always;
  }

  Condition takeCondition() {
    Condition condition{.isNegated = takes("not")};
    if (takes("the")) {
      if (!takes("end")) wrong("\"end\"");
      return condition;
    }
    const KindRow* const row = takeKind();
    condition.kind = row->kind;
    condition.column = column();
    if (row->operands == Operands::key) {
      condition.keys = {takeWord("the key of a list")};
      if (!script_.listUnder(condition.keys[0])) wrongKey(condition);
      if (row->kind == Kind::listRan) takes("ran");
    } else if (row->operands == Operands::step) {
      condition.keys = keysOfStep();
    } else {
      takeControl(condition);
      if (row->operands == Operands::controlAndWord) condition.word = takeWord("what it shows");
    }
    return condition;
  }

  /// Returns the keys of the lists that lead to the step.
  std::vector<std::string> keysOfStep() {
    const std::string word = nextWord();
    std::vector<std::string> keys;
    std::vector<std::string_view> steps;
    for (const auto& [key, step] : names_.steps) {
      steps.push_back(step);
      if (step == word) keys.push_back(key);
    }
    if (keys.empty()) wrong("the name of a step of a source", didYouMean(word, steps));
    ++next_;
    return keys;
  }

  /// Takes the name that a source gives to a control, or its tag.
  void takeControl(Condition& condition) {
    const std::string word = nextWord();
    const auto known = controlNames();
    if (std::find(known.begin(), known.end(), word) != known.end()) {
      condition.name = takeWord("the name of a control");
    } else if (const auto tag = walkthrough::parseNumber<Tag>(word)) {
      condition.tag = *tag;
      ++next_;
    } else {
      wrong(known.empty() ? "the tag of a control" : "the name of a control",
            didYouMean(word, known));
    }
  }

  std::vector<std::string_view> controlNames() const {
    std::vector<std::string_view> names;
    for (const auto& [tag, name] : names_.controls) names.push_back(name);
    return names;
  }

  const KindRow* takeKind() {
    const auto* const row = std::find_if(std::begin(kindRows), std::end(kindRows),
                                         [&](const KindRow& each) { return takes(each.word); });
    if (row != std::end(kindRows)) return row;
    std::vector<std::string> words{"the end"};
    std::vector<std::string_view> candidates;
    for (const KindRow& each : kindRows) {
      words.emplace_back(each.word);
      candidates.push_back(each.word);
    }
    wrong("a condition (" + enumerate(words) + ")",
          next_ < line_.words.size() ? didYouMean(line_.words[next_], candidates) : "");
  }

  template <class Number>
  Number takeNumber(const std::string& expected) {
    const auto number = next_ < line_.words.size()
                            ? walkthrough::parseNumber<Number>(line_.words[next_])
                            : std::nullopt;
    if (!number) wrong(expected);
    ++next_;
    return *number;
  }

  /// Returns the next word; empty at the end of the line.
  std::string nextWord() const { return next_ < line_.words.size() ? line_.words[next_] : ""; }

  std::string takeWord(const std::string& expected) {
    if (next_ == line_.words.size()) wrong(expected);
    return line_.words[next_++];
  }

  bool takes(std::string_view word) {
    if (next_ == line_.words.size() || line_.words[next_] != word) return false;
    ++next_;
    return true;
  }

  /// Returns where the next word begins, or where the line ends.
  std::size_t column() const { return line_.columns[next_]; }

  [[noreturn]] void wrong(const std::string& expected, const std::string& suggestion = "") const {
    const std::string found =
        next_ < line_.words.size() ? quote(line_.words[next_]) : "the end of the line";
    throw Failure(ExitStatus::badInput, place_.text(column()) + ": expected " + expected +
                                            ", found " + found + suggestion);
  }
  [[noreturn]] void wrongKey(const Condition& condition) const {
    std::vector<std::string_view> keys;
    for (const ScriptList& list : script_.lists()) keys.push_back(list.key);
    throw Failure(ExitStatus::badInput, place_.text(condition.column) +
                                            ": the script has no list " + quote(condition.keys[0]) +
                                            didYouMean(condition.keys[0], keys));
  }

  const Line& line_;
  FileLine place_;
  const Script& script_;
  const walkthrough::Names& names_;
  std::size_t next_ = 0;
};

bool isLook(const Condition& condition) {
  return std::any_of(std::begin(kindRows), std::end(kindRows),
                     [&](const KindRow& row) { return row.kind == condition.kind && row.isLook; });
}

}  // namespace

std::vector<Expectation> readExpectations(const std::string& path, const Script& script,
                                          const walkthrough::Names& names) {
  std::vector<Expectation> expectations;
  for (const Line& line : linesOf(path, "expectations")) {
    expectations.push_back(Parser(line, {path, line.number}, script, names).parse());
  }
  return expectations;
}

bool isAboutControl(const Condition& condition) {
  return condition.kind != Kind::end && condition.kind != Kind::listRan &&
         condition.kind != Kind::timer;
}

bool compareLooks(const std::vector<Expectation>& expectations) {
  return std::any_of(expectations.begin(), expectations.end(), [](const Expectation& each) {
    return each.consequence && isLook(each.condition) && isLook(*each.consequence);
  });
}

}  // namespace qz::tools::check
