// SPDX-License-Identifier: MIT
// Statements that say what must be true.

#include "tools/scenario/properties.hpp"
#include "tools/scenario/references.hpp"
#include "tools/scenario/statements.hpp"
#include "tools/scenario/unmet.hpp"
#include "tools/scenario/values.hpp"
#include "tools/scenario/wildcard.hpp"

namespace qz::tools::scenario {
namespace expecting {
namespace {

[[noreturn]] void refuse(const Wanted& wanted, const Reading& reading) {
  auto got = show(reading);
  if (reading && reading->is_structured() && reading->type() == wanted.value.type()) {
    got += " (they differ at " + whereDifferent(wanted.value, *reading) + ")";
  }
  throw Unmet(show(wanted), got);
}

void requireSame(const Wanted& wanted, const Reading& reading) {
  if (!wanted.holdsFor(reading)) refuse(wanted, reading);
}

Outcome state(Stage& stage, const Arguments& a) {
  const auto state = stage.engines.existing()->currentCommandState();
  if (state != a.text("TEXT")) throw Unmet(inQuotes(a.text("TEXT")), inQuotes(state));
  return {};
}

Outcome logLine(Stage& stage, const Arguments& a) {
  const auto* const entry = stage.log.next();
  const auto wanted = inQuotes(a.text("TEXT"));
  if (!entry) throw Unmet("the log line " + wanted, "no further line");
  const auto& names = stage.classNames;
  if (!matchesPattern(names.unified(a.text("TEXT")), names.unified(entry->text))) {
    throw Unmet("the log line " + wanted, inQuotes(entry->text));
  }
  stage.log.expectNext();
  return {};
}

Outcome noLog(Stage& stage, const Arguments&) {
  const auto* const entry = stage.log.next();
  if (entry) throw Unmet("no log line", inQuotes(entry->text));
  return {};
}

Outcome ignoreLog(Stage& stage, const Arguments&) {
  stage.log.ignoreAll();
  return {};
}

Outcome same(Stage& stage, const Arguments& a) {
  const auto first = stage.cast.control(a.text("C"));
  const auto second = stage.cast.control(a.text("C2"));
  if (!(first == second)) {
    throw Unmet("one control", *stage.cast.nameOf(first) + " and " + *stage.cast.nameOf(second));
  }
  return {};
}

Outcome noControl(Stage& stage, const Arguments& a) {
  const auto found = stage.cast.findControl(a.text("C"));
  if (found) throw Unmet("no control " + a.text("C"), *stage.cast.nameOf(found));
  return {};
}

Outcome alive(Stage& stage, const Arguments&) {
  if (!stage.engines.current()) throw Unmet("the engine alive", "a destroyed engine");
  return {};
}

Outcome destroyed(Stage& stage, const Arguments&) {
  if (stage.engines.current()) throw Unmet("the engine destroyed", "a living engine");
  return {};
}

Outcome delegateEnds(Stage& stage, const Arguments& a) {
  requireSame({Wanted::Kind::value, a.word("LIST").value},
              Json(stage.sheetDelegate->returnCodes()));
  return {};
}

Outcome entries(Stage& stage, const Arguments& a) {
  requireSame({Wanted::Kind::value, a.word("OBJECT").value},
              stage.entries ? Reading(toJson(stage.entries)) : std::nullopt);
  return {};
}

// --- properties ---

struct Shown {
  Reading reading;
  Takes takes;
  bool namesClasses;
};

Shown showing(Reading reading, const std::vector<PropertyInfo>& infos,
              const std::string& property) {
  const auto& info = infoNamed(infos, property);
  return {std::move(reading), info.read, info.namesClasses};
}

Reading atKey(const Reading& reading, const std::string& key) {
  if (!reading || !reading->is_object()) return std::nullopt;
  const auto found = reading->find(key);
  return found == reading->end() ? Reading() : Reading(*found);
}

Shown showKept(const Kept& kept, const Path& path) {
  auto reading = kept.read();
  if (path.property) reading = atKey(reading, *path.property + (path.key ? "." + *path.key : ""));
  return {std::move(reading), anyExpectation, kept.namesClasses};
}

Shown showPath(Stage& stage, const Path& path) {
  const auto& known = vocabulary();
  if (const auto kept = stage.kept.find(path.subject); kept != stage.kept.end()) {
    return showKept(kept->second, path);
  }
  const auto& property = path.property.value();
  if (path.subject == "engine") {
    const auto engine = stage.engines.existing();
    auto shown = showing(keepEngineProperty(stage, *engine, property)(), known.engine, property);
    if (path.key) shown = {atKey(shown.reading, *path.key), anyExpectation, shown.namesClasses};
    return shown;
  }
  if (stage.cast.namesWindow(path.subject)) {
    const auto window = stage.cast.window(path.subject);
    return showing(readWindowProperty(stage, window, property), known.window, property);
  }
  const auto control = stage.cast.control(path.subject);
  return showing(readControlProperty(stage, control, property), known.control, property);
}

Outcome property(Stage& stage, const Arguments& a) {
  const auto shown = showPath(stage, splitPath(a.text("PROPERTY")));
  const auto wanted = readValue(a.word("VALUE"), shown.takes).value();
  if (!shown.namesClasses || !shown.reading) {
    requireSame(wanted, shown.reading);
    return {};
  }
  const auto& names = stage.classNames;
  const Wanted unified{wanted.kind, names.unifiedTexts(wanted.value)};
  if (!unified.holdsFor(names.unifiedTexts(*shown.reading))) refuse(wanted, shown.reading);
  return {};
}

constexpr StatementKind table[] = {
    {"expect state TEXT", Result::never, state},
    {"expect log TEXT", Result::never, logLine},
    {"expect no log", Result::never, noLog},
    {"expect no C", Result::never, noControl},
    {"expect same C C2", Result::never, same},
    {"expect alive", Result::never, alive},
    {"expect destroyed", Result::never, destroyed},
    {"expect delegate.ends LIST", Result::never, delegateEnds},
    {"expect entries OBJECT", Result::never, entries},
    {"expect PROPERTY VALUE", Result::never, property},
    {"ignore log", Result::never, ignoreLog},
};

}  // namespace
}  // namespace expecting

std::span<const StatementKind> expectingStatements() { return expecting::table; }

}  // namespace qz::tools::scenario
