// SPDX-License-Identifier: MIT
// Everything that a window's objects tell of themselves, to compare before and after.
#pragma once

#include <QMetaProperty>
#include <QWidget>
#include <map>
#include <set>

namespace qz::hosts {

/// Values by the names of an object and its property.
using Snapshot = std::map<QString, QVariant>;

/// `QObject::receivers` is protected.
struct Receivers : QObject {
  static int of(const QObject& object, const QMetaMethod& signal) {
    const QByteArray signature = '2' + signal.methodSignature();
    return (object.*&Receivers::receivers)(signature);
  }
};

/// Adds every property and dynamic property of the object, how many receivers each of its signals
/// has, and how many children it has.
inline void addTo(Snapshot& snapshot, const QObject& object, const QString& called) {
  const QString name = called + '.';
  const QMetaObject& meta = *object.metaObject();
  for (int i = 0; i < meta.propertyCount(); ++i) {
    snapshot[name + meta.property(i).name()] = meta.property(i).read(&object);
  }
  for (const QByteArray& property : object.dynamicPropertyNames()) {
    snapshot[name + property] = object.property(property);
  }
  for (int i = 0; i < meta.methodCount(); ++i) {
    if (meta.method(i).methodType() == QMetaMethod::Signal) {
      snapshot[name + meta.method(i).methodSignature()] = Receivers::of(object, meta.method(i));
    }
  }
  snapshot[name + "children()"] = object.children().size();
}

/// Returns the names of the values that differ.
inline std::set<QString> differences(const Snapshot& before, const Snapshot& after) {
  std::set<QString> names;
  for (const auto& [name, value] : before) {
    if (!after.contains(name) || after.at(name) != value) names.insert(name);
  }
  for (const auto& [name, value] : after) {
    if (!before.contains(name)) names.insert(name);
  }
  return names;
}

inline std::set<QString> without(std::set<QString> names, const std::set<QString>& others) {
  for (const QString& name : others) names.erase(name);
  return names;
}

}  // namespace qz::hosts
