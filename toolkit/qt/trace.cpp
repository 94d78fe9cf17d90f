// SPDX-License-Identifier: MIT
// Compares facets before and after each change.

#include "toolkit/qt/trace.hpp"

#include <algorithm>
#include <utility>

#include "toolkit/qt/adopted_form.hpp"

namespace qz::toolkit::qt {

namespace {

int depthOf(const QWidget& widget) {
  int depth = 0;
  for (const QWidget* around = &widget; around; around = around->parentWidget()) ++depth;
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

void look(QWidget& widget, const Facet& facet, std::vector<Sighting>& sightings) {
  QVariant value = facet.read(widget);
  if (value.isValid()) sightings.push_back({&widget, &facet, std::move(value)});
}

}  // namespace

std::vector<Sighting> sightingsAround(QWidget& widget, bool withReactions) {
  std::vector<Sighting> sightings;
  const auto lookAt = [&](QWidget& one, Facet::Reach reach) {
    for (const Facet& facet : facets()) {
      if (facet.reach == reach) look(one, facet, sightings);
    }
  };
  const auto near = widgetsConcernedBy(widget);
  for (QWidget* const one : near) lookAt(*one, Facet::Reach::near);
  for (QWidget* const one : withReactions ? formAround(widget) : near) {
    lookAt(*one, Facet::Reach::form);
  }
  return sightings;
}

void Trace::note(const std::vector<Sighting>& before) {
  for (const Sighting& sighting : before) {
    if (!sighting.widget) continue;
    const QVariant now = sighting.facet->read(*sighting.widget);
    if (now != sighting.value) remember(sighting, now);
  }
}

// If somebody else has changed the facet since our last change, theirs is the one to restore.
void Trace::remember(const Sighting& before, const QVariant& now) {
  const auto known = std::find_if(entries_.begin(), entries_.end(), [&](const Entry& entry) {
    return entry.widget == before.widget && entry.facet == before.facet;
  });
  if (known == entries_.end()) {
    entries_.push_back({before.widget, before.facet, before.value, now});
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
    return a.facet != b.facet ? a.facet > b.facet : depthOf(*a.widget) > depthOf(*b.widget);
  });
  for (const Entry& entry : entries) {
    if (entry.widget) entry.facet->write(*entry.widget, entry.original);
  }
}

// Twice, because a page that is shown again may enlarge the window.
void Trace::undo() {
  undoNoted();
  undoNoted();
}

}  // namespace qz::toolkit::qt
