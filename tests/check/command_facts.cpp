// SPDX-License-Identifier: MIT
// What the commands of a script did in all their runs.
#include "tests/check/command_facts.hpp"

#include <utility>

namespace qz::naive {

CommandFacts::CommandFacts(Script script, std::vector<drivers::ViewKind> kinds)
    : script_(std::move(script)), kinds_(std::move(kinds)) {}

void CommandFacts::note(const Trace& trace, std::size_t pathLength) {
  for (const CommandRun& run : trace.commands) note(run, pathLength);
  for (const toolkit::Tag tag : trace.sharedPresses) {
    known_.add({"same-tag", "", std::nullopt, tag, pathLength});
  }
  if (trace.endless) known_.add("endless-chain", *trace.endless, std::nullopt, pathLength);
  for (const BriefText& text : trace.brief) {
    known_.add("too-brief", text.site, text.tag, pathLength);
  }
  lists_.insert(trace.lists.begin(), trace.lists.end());
  for (const TimerStart& start : trace.started) started_[start].add(pathLength);
  for (const TimerStart& start : trace.fired) fired_.insert(start.site);
  for (const TimerStart& start : trace.beaten) beaten_.insert(start.site);
}

void CommandFacts::note(const CommandRun& run, std::size_t pathLength) {
  Element& element = elements_[run.site];
  if (run.tag) element.tag = run.tag;
  if (run.raised && !run.raisesBySight) known_.add("raises", run.site, run.tag, pathLength);
  if (run.tagIsShared) known_.add("same-tag", run.site, run.tag, pathLength);
  noteSearch(run, element, pathLength);
  const bool flashes =
      run.command && run.command->constant == "QZ_PLIST_STATE_PARSER_FLASH_ID" && run.tag;
  if (flashes) (run.result || run.raised ? element.accepted : element.refused).add(pathLength);
}

void CommandFacts::noteSearch(const CommandRun& run, Element& element,
                              std::size_t pathLength) const {
  if (!run.sought) return;
  const bool isTimer =
      run.command->positionOf(ParameterType::controlOrListTag).has_value();  // a list will do
  if (!run.found && isTimer && script_->objectForKey(std::to_string(*run.tag))) return;
  (run.found ? element.found : element.notFound).add(pathLength);
  if (run.found && !suits(run.command->target, kinds_[*run.found])) {
    element.wrongKind.add(pathLength);
  }
}

void CommandFacts::report(bool complete, Findings& findings) const {
  for (const Finding& finding : known_.all()) findings.add(finding);
  for (const auto& [site, element] : elements_) reportElement(site, element, complete, findings);
  if (!complete) return;
  reportTimers(findings);
  reportLists(findings);
}

// A control that was not found in some runs only is worth a note, which further runs do not refute.
void CommandFacts::reportElement(const Site& site, const Element& element, bool complete,
                                 Findings& findings) const {
  if (element.notFound.times > 0 && (complete || element.found.times > 0)) {
    findings.add("no-target", site, element.tag, element.notFound.pathLength);
  }
  if (!complete) return;
  if (element.wrongKind.times > 0 && element.wrongKind.times == element.found.times) {
    findings.add("wrong-target", site, element.tag, element.wrongKind.pathLength);
  }
  if (element.refused.times > 0 && element.accepted.times == 0) {
    findings.add("flash-decided", site, element.tag, element.refused.pathLength);
  }
}

void CommandFacts::reportTimers(Findings& findings) const {
  for (const auto& [start, count] : started_) {
    if (fired_.contains(start.site) || !beaten_.contains(start.site)) continue;
    findings.add("never-fires", start.site, std::stoll(start.key), count.pathLength);
  }
}

void CommandFacts::reportLists(Findings& findings) const {
  for (const auto& entry : script_->entries()) {
    const std::string key = entry.key->description();
    if (toolkit::asArray(entry.value) && !lists_.contains(key)) {
      findings.add({"never-runs", key, std::nullopt, std::nullopt, 0});
    }
  }
}

}  // namespace qz::naive
