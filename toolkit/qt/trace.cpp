// SPDX-License-Identifier: MIT
// Compares facets before and after each change.

#include "toolkit/qt/trace.hpp"

#include <QAction>
#include <algorithm>
#include <functional>
#include <initializer_list>
#include <utility>

#include "toolkit/qt/action_facets.hpp"
#include "toolkit/qt/adopted_form.hpp"

namespace qz::toolkit::qt {

namespace {

// 0 for an action.
int depthOf(const QObject& object) {
  int depth = 0;
  for (const auto* around = qobject_cast<const QWidget*>(&object); around;
       around = around->parentWidget())
    ++depth;
  return depth;
}

// A floating dock is not the window.
const QWidget& windowAround(const QWidget& widget) {
  const QWidget* around = &widget;
  while (isPartOfForm(*around) && around->parentWidget()) around = around->parentWidget();
  return *around;
}

std::vector<QWidget*> formAround(const QWidget& widget) {
  const auto found = windowAround(widget).findChildren<QWidget*>();
  return {found.begin(), found.end()};
}

void look(QObject& object, const Facet& facet, std::vector<Sighting>& sightings) {
  QVariant value = facet.read(object);
  if (value.isValid()) sightings.push_back({&object, &facet, std::move(value)});
}

void look(QWidget& widget, std::initializer_list<Aspect> aspects,
          std::vector<Sighting>& sightings) {
  for (const Facet& facet : facets()) {
    const bool isMeant = std::find(aspects.begin(), aspects.end(), facet.aspect) != aspects.end();
    if (isMeant) look(widget, facet, sightings);
  }
}

void lookAtReactionsIn(const QWidget& window, std::vector<Sighting>& sightings) {
  for (QWidget* const one : formAround(window)) {
    look(*one, {Aspect::hidden, Aspect::enabled}, sightings);
  }
}

}  // namespace

// A command that hides or disables a widget moves the focus; one that hides a tab turns the page.
// No facet may be sighted twice.
std::vector<Sighting> sightingsAround(const WidgetChange& change) {
  std::vector<Sighting> sightings;
  const bool hides = change.aspect == Aspect::hidden;
  if (!hides) look(change.widget, {change.aspect}, sightings);
  // Qt writes the styled text of an edit again when the palette of the edit changes.
  const bool mayRedress = hides || change.aspect == Aspect::enabled;
  if (mayRedress) look(change.widget, {Aspect::contents}, sightings);
  QWidget* const first =
      change.aspect == Aspect::contents ? firstOfChoiceWith(change.widget) : nullptr;
  if (first) look(*first, {Aspect::choice}, sightings);
  const auto around = widgetsAround(change.widget);
  if (change.bringsIntoView || hides) {
    for (QWidget* const one : around) {
      look(*one, {Aspect::place}, sightings);
      if (!change.withReactions) look(*one, {Aspect::hidden}, sightings);
    }
  }
  if (change.bringsIntoView || hides || change.aspect == Aspect::enabled) {
    look(*around.back(), {Aspect::focus}, sightings);
  }
  if (change.withReactions) lookAtReactionsIn(change.widget, sightings);
  return sightings;
}

std::vector<Sighting> sightingsAround(QAction& action, QWidget& window, bool withReactions) {
  std::vector<Sighting> sightings;
  for (const Facet& facet : actionFacets()) look(action, facet, sightings);
  if (withReactions) lookAtReactionsIn(window, sightings);
  return sightings;
}

void Trace::note(const std::vector<Sighting>& before) {
  for (const Sighting& sighting : before) {
    if (!sighting.object) continue;
    const QVariant now = sighting.facet->read(*sighting.object);
    if (now != sighting.value) remember(sighting, now);
  }
}

// If somebody else has changed the facet since our last change, theirs is the one to restore.
void Trace::remember(const Sighting& before, const QVariant& now) {
  const auto known = std::find_if(entries_.begin(), entries_.end(), [&](const Entry& entry) {
    return entry.object == before.object && entry.facet == before.facet;
  });
  if (known == entries_.end()) {
    entries_.push_back({before.object, before.facet, before.value, now});
    return;
  }
  if (known->ours != before.value) known->original = before.value;
  known->ours = now;
}

// What is ours is decided first: restoring one facet may change another. The later facets of the
// table come first, whatever the order of the changes. Of those, inner widgets come before those
// around them, so that a page is restored while it is shown.
void Trace::undoNoted() {
  auto entries = std::exchange(entries_, {});
  std::erase_if(entries, [](const Entry& entry) { return !entry.isOurs(); });
  std::stable_sort(entries.begin(), entries.end(), [](const Entry& a, const Entry& b) {
    if (a.facet != b.facet) return std::greater<>()(a.facet, b.facet);
    return depthOf(*a.object) > depthOf(*b.object);
  });
  for (const Entry& entry : entries) {
    if (entry.object) entry.facet->write(*entry.object, entry.original);
  }
}

// Twice, because a page that is shown again may enlarge the window.
void Trace::undo() {
  undoNoted();
  undoNoted();
}

}  // namespace qz::toolkit::qt
