// SPDX-License-Identifier: MIT
#include "hosts/qt/resumption.hpp"

#include <QStringList>

#include "engine/tag_key.hpp"

namespace qz::hosts::qt {

namespace {

constexpr int formatVersion = 1;

// A press needs no list, as the press of a check box that only the host reads.
std::string problemWith(const QString& text, const toolkit::Dictionary& lists) {
  const auto step = JournalStep::of(text);
  if (!step) return "its state has the unknown step \"" + text.toStdString() + "\"";
  if (step->isPress || lists.objectForKey(tagKey(step->tag))) return {};
  return "its state is of another script, which had a list " + tagKey(step->tag);
}

}  // namespace

QVariantMap stateOf(const QVariant& script, const std::vector<JournalStep>& steps) {
  QStringList texts;
  for (const JournalStep& step : steps) texts << step.text();
  return {{"version", formatVersion}, {"script", script}, {"steps", texts}};
}

Resumption resumptionOf(const QVariantMap& state, const toolkit::Dictionary& lists) {
  Resumption resumption;
  const QStringList texts = state["steps"].toStringList();
  if (state["version"].toInt() != formatVersion || texts.isEmpty()) {
    resumption.problem = "this state is not one that this version can resume";
    return resumption;
  }
  for (const QString& text : texts) {
    resumption.problem = problemWith(text, lists);
    if (!resumption.problem.empty()) break;
    resumption.steps.push_back(*JournalStep::of(text));
  }
  return resumption;
}

}  // namespace qz::hosts::qt
