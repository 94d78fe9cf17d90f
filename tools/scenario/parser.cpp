// SPDX-License-Identifier: MIT
// Parses the text of a scenario file.

#include "tools/scenario/parser.hpp"

#include <algorithm>
#include <memory>
#include <span>
#include <utility>

#include "tools/scenario/form_matcher.hpp"
#include "tools/scenario/references.hpp"
#include "tools/scenario/slots.hpp"

namespace qz::tools::scenario {
namespace {

// The statements that structure the file. Their forms follow the vocabulary's own.
constexpr Form scenarioForm{"scenario TEXT..."};
constexpr Form onlyForm{"only TOOLKIT..."};

constexpr int deepestStatement = 20;

class FileParser {
 public:
  explicit FileParser(const Vocabulary& vocabulary)
      : vocabulary_(vocabulary), ownForms_(vocabulary.forms.size()) {
    vocabulary_.forms.insert(vocabulary_.forms.end(), {scenarioForm, onlyForm});
  }

  ScenarioFile parse(std::string_view text) {
    const auto lines = readWords(text);
    if (!lines.empty()) currentAt_ = lines.front().words.front().at;
    Scenario common;
    Scenario* current = &common;
    for (const auto& line : lines) {
      if (line.words.front().isBare("scenario")) {
        current = &beginScenario(line, common);
      } else if (line.words.front().isBare("only")) {
        current->only = match(line).arguments.texts("TOOLKIT");
      } else {
        current->statements.push_back(statement(line.words, line.end, line.source, 0));
      }
    }
    requireStatements(*current);
    if (file_.scenarios.empty()) {
      common.line = currentAt_.line;
      file_.scenarios.push_back(std::move(common));
    } else {
      file_.common = std::move(common.statements);
    }
    return std::move(file_);
  }

 private:
  Match match(const Line& line) { return matchForm(line.words, line.end, vocabulary_, names_); }

  Scenario& beginScenario(const Line& line, const Scenario& common) {
    if (file_.scenarios.empty()) {
      commonNames_ = names_;
    } else {
      requireStatements(file_.scenarios.back());
    }
    names_ = commonNames_;
    currentAt_ = line.words.front().at;
    file_.scenarios.push_back({titleOf(line), currentAt_.line, common.only, {}});
    return file_.scenarios.back();
  }

  std::string titleOf(const Line& line) {
    std::string title;
    for (const auto& word : match(line).arguments.texts("TEXT")) {
      title += (title.empty() ? "" : " ") + word;
    }
    return title;
  }

  // An empty scenario would pass without testing anything.
  void requireStatements(const Scenario& current) const {
    if (current.statements.empty()) throw SyntaxError(currentAt_, "a scenario without a statement");
  }

  Statement statement(std::span<const Word> words, Position end, const std::string& source,
                      int depth) {
    if (depth > deepestStatement) {
      throw SyntaxError(words.front().at, "statements nested too deeply");
    }
    const auto arrow = std::find_if(words.begin(), words.end(),
                                    [](const Word& word) { return word.isBare("=>"); });
    const std::span<const Word> call(words.begin(), arrow);
    if (call.empty()) throw SyntaxError(words.front().at, "expected a statement before =>");
    auto match = matchForm(call, arrow == words.end() ? end : arrow->at, vocabulary_, names_);
    if (match.form >= ownForms_) {
      throw SyntaxError(words.front().at,
                        describe(words.front()) + " cannot be used inside another statement");
    }
    for (const auto& [name, kind] : match.declared) names_.declare(name, kind);
    Statement statement{match.form, std::move(match.arguments), {}, words.front().at, source};
    if (match.used < call.size()) {
      statement.arguments.setNested(std::make_shared<const Statement>(
          this->statement(words.subspan(match.used), end, source, depth + 1)));
    } else if (arrow != words.end()) {
      statement.clause = clause({arrow, words.end()}, end, vocabulary_.forms[match.form].result);
    }
    return statement;
  }

  /// `words` begins with the arrow.
  Clause clause(std::span<const Word> words, Position end, Result result) {
    if (result == Result::never) throw SyntaxError(words[0].at, "this statement has no result");
    if (words.size() > 2) {
      throw SyntaxError(words[2].at,
                        "found " + describe(words[2]) + ", expected the end of the line");
    }
    if (words.size() == 2 && words[1].isBare("raises")) return {true, {}};
    if (words.size() == 2 && fitsResult(words[1], result)) return {false, words[1]};
    const auto found = words.size() == 2 ? describe(words[1]) : "the end of the line";
    throw SyntaxError(words.size() == 2 ? words[1].at : end,
                      "found " + found + ", expected " + expectedResults(result));
  }

  bool fitsResult(const Word& word, Result result) {
    if (result == Result::flag) return word.isBare("YES") || word.isBare("NO");
    if (result != Result::control) return false;
    SlotContext context{vocabulary_, names_};
    return word.isBare("none") || slotNamed("C").fits(word, context);
  }

  static std::string expectedResults(Result result) {
    if (result == Result::flag) return "YES, NO or raises";
    return result == Result::control ? "a control, none or raises" : "raises";
  }

  Vocabulary vocabulary_;
  std::size_t ownForms_;
  Names names_;
  Names commonNames_;
  ScenarioFile file_;
  Position currentAt_;  // where the scenario that is being read begins
};

}  // namespace

ScenarioFile parseScenarios(std::string_view text, const Vocabulary& vocabulary) {
  return FileParser(vocabulary).parse(text);
}

}  // namespace qz::tools::scenario
