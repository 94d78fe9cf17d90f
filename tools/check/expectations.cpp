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
enum class Operands : std::uint8_t { key, tag, tagAndWord };

struct KindRow {
  std::string_view word;
  Kind kind;
  Operands operands;
  bool isLook = false;
};

// "the end" has two words and no operand, so it is not a row.
constexpr KindRow kindRows[] = {
    {"list", Kind::listRan, Operands::key},
    {"hidden", Kind::hidden, Operands::tag},
    {"shown", Kind::shown, Operands::tag},
    {"enabled", Kind::enabled, Operands::tag},
    {"disabled", Kind::disabled, Operands::tag},
    {"on", Kind::on, Operands::tag, true},
    {"off", Kind::off, Operands::tag, true},
    {"text", Kind::text, Operands::tagAndWord, true},
    {"title", Kind::title, Operands::tagAndWord, true},
    {"image", Kind::image, Operands::tagAndWord, true},
    {"tooltip", Kind::toolTip, Operands::tagAndWord, true},
    {"timer", Kind::timer, Operands::key},
};

constexpr const char* ruleWords =
    "\"can reach\", \"always can reach\", \"always\", \"never\", \"whenever\" or \"within\"";

class Parser {
 public:
  Parser(const Line& line, FileLine place, const Script& script)
      : line_(line), place_(std::move(place)), script_(script) {}

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
      condition.word = takeWord("the key of a list");
      if (!script_.listUnder(condition.word)) wrongKey(condition);
      if (row->kind == Kind::listRan) takes("ran");
      return condition;
    }
    condition.tag = takeNumber<Tag>("the tag of a control");
    if (row->operands == Operands::tagAndWord) condition.word = takeWord("what it shows");
    return condition;
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
                                            ": the script has no list " + quote(condition.word) +
                                            didYouMean(condition.word, keys));
  }

  const Line& line_;
  FileLine place_;
  const Script& script_;
  std::size_t next_ = 0;
};

bool isLook(const Condition& condition) {
  return std::any_of(std::begin(kindRows), std::end(kindRows),
                     [&](const KindRow& row) { return row.kind == condition.kind && row.isLook; });
}

}  // namespace

std::vector<Expectation> readExpectations(const std::string& path, const Script& script) {
  std::vector<Expectation> expectations;
  for (const Line& line : linesOf(path, "expectations")) {
    expectations.push_back(Parser(line, {path, line.number}, script).parse());
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
