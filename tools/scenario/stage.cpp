// SPDX-License-Identifier: MIT
// The stage of one scenario: performs statements.

#include "tools/scenario/stage.hpp"

#include <exception>
#include <utility>

#include "tools/scenario/statements.hpp"
#include "tools/scenario/unmet.hpp"
#include "tools/support/stack_guard.hpp"

namespace qz::tools::scenario {
namespace {

/// Replaces a value, and restores the old one on destruction.
template <class T>
class Replaced {
 public:
  Replaced(T& place, T value) : place_(place), before_(std::exchange(place, std::move(value))) {}
  ~Replaced() { place_ = std::move(before_); }
  Replaced(const Replaced&) = delete;
  Replaced& operator=(const Replaced&) = delete;

 private:
  T& place_;
  T before_;
};

/// As long as this exists, a script that exhausts the stack ends the tool with a line that names
/// the place and the lists.
class GuardedStack {
 public:
  GuardedStack(const std::shared_ptr<Engine>& engine, const std::string& place) {
    if (engine) guardScript(*engine, place, engine->plistDictionary());
  }
  ~GuardedStack() { forgetScript(); }
  GuardedStack(const GuardedStack&) = delete;
  GuardedStack& operator=(const GuardedStack&) = delete;
};

std::string replaceAll(std::string text, std::string_view what, const std::string& with) {
  for (auto at = text.find(what); at != std::string::npos; at = text.find(what, at + with.size())) {
    text.replace(at, what.size(), with);
  }
  return text;
}

std::string describe(const Outcome& outcome, const Cast& cast) {
  switch (outcome.kind) {
    case Result::flag:
      return outcome.flag ? "YES" : "NO";
    case Result::control:
      return cast.nameOf(outcome.control).value_or("none");
    case Result::never:
    case Result::nothing:
      break;
  }
  return "ok";
}

void requireOutcome(const Clause& clause, const Outcome& outcome, const Cast& cast) {
  const auto got = describe(outcome, cast);
  if (clause.raises) throw Unmet("an exception", got);
  const auto& wanted = clause.result.text;
  const bool same = outcome.kind != Result::control ? wanted == got
                    : wanted == "none"              ? !outcome.control
                                                    : cast.control(wanted) == outcome.control;
  if (!same) throw Unmet(wanted, got);
}

}  // namespace

Stage::Stage(drivers::Driver& driverToUse, std::string nameOfFile, Performed performed)
    : driver(driverToUse),
      file(std::move(nameOfFile)),
      classNames(driverToUse),
      host(std::make_shared<HostResponder>([this](const Cast::View& sender) {
        happened({Reactions::Event::Kind::action, {}, sender});
      })),
      sheetDelegate(std::make_shared<SheetRecorder>([this] {
        happened({Reactions::Event::Kind::sheetEnd, {}, {}});
      })),
      cast(engines),
      entries(toolkit::Dictionary::make()),
      performed_(std::move(performed)) {
  driver.setResourcePath(resources.path());
  driver.setLogSink([this](std::string_view line) {
    log.add(line);
    happened({Reactions::Event::Kind::log, std::string(line), {}});
  });
}

// Lines logged while windows and engines are destroyed are not part of the scenario.
Stage::~Stage() { driver.setLogSink({}); }

void Stage::perform(const Statement& statement) {
  // Nothing here keeps the engine alive during the statement, which may have to destroy it.
  const GuardedStack guarded(engines.current(), placeOf(statement));
  performHere(statement);
  if (auto failed = std::exchange(failedReaction_, std::nullopt)) throw Failed(*failed);
}

std::string Stage::placeOf(const Statement& statement) const {
  return file + ":" + std::to_string(statement.at.line);
}

void Stage::performHere(const Statement& statement) {
  const Replaced<const Statement*> now(current, &statement);
  const Replaced<int> line(log.statementLine, statement.at.line);
  const bool mayRaise = statement.clause && statement.clause->raises;
  try {
    const auto arguments = statement.arguments.changed(
        [this](std::string text) { return withPaths(std::move(text)); });
    const auto outcome = statementKinds()[statement.form].run(*this, arguments);
    if (statement.clause) requireOutcome(*statement.clause, outcome, cast);
    performed_(statement, describe(outcome, cast));
  } catch (const Unmet& unmet) {
    throw Failed{&statement, unmet.what()};
  } catch (const toolkit::Exception& exception) {
    const auto raised = exception.name() + ": " + exception.reason();
    if (!mayRaise) throw Failed{&statement, "expected no exception, got " + raised};
    performed_(statement, "raised " + raised);
  } catch (const std::exception& exception) {
    throw Failed{&statement, std::string("expected no exception, got ") + exception.what()};
  }
}

void Stage::requireNothingLeft(const Statement& last) {
  if (!reactions.waiting().empty()) {
    const auto& reaction = reactions.waiting().front();
    throw Failed{reaction.when, "expected " + reaction.awaited + ", got none"};
  }
  const auto* const entry = log.next();
  if (!entry) return;
  auto problem = "expected no further log line, got " + inQuotes(entry->text) + " logged in line " +
                 std::to_string(entry->statementLine);
  if (log.left() > 1) problem += " (and " + std::to_string(log.left() - 1) + " more)";
  throw Failed{&last, problem};
}

// A reaction runs within a call of the toolkit, which our exceptions must not pass through: the
// first failure is kept until the statement that caused it is over.
void Stage::happened(const Reactions::Event& event) {
  for (const auto& reaction : reactions.take(event)) {
    try {
      performHere(*reaction.statement);
    } catch (const Failed& failed) {
      if (!failedReaction_) failedReaction_ = failed;
    }
  }
}

std::string Stage::withPaths(std::string text) const {
  text = replaceAll(std::move(text), "$RESOURCES", resources.path());
  return replaceAll(std::move(text), "$MISSING", resources.missingPath());
}

}  // namespace qz::tools::scenario
