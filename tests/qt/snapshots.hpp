// SPDX-License-Identifier: MIT
// Everything that a window's objects tell of themselves, to compare before and after.
#pragma once

#include <QIcon>
#include <QMetaProperty>
#include <QPixmap>
#include <QPointer>
#include <QToolBar>
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

/// Returns what can be compared in place of `value`: Qt never finds two icons or pixmaps equal.
inline QVariant comparable(const QVariant& value) {
  if (value.typeId() == QMetaType::QIcon) return value.value<QIcon>().cacheKey();
  if (value.typeId() == QMetaType::QPixmap) return value.value<QPixmap>().cacheKey();
  return value;
}

/// Adds every property and dynamic property of the object, how many receivers each of its signals
/// has, and how many children it has.
inline void addTo(Snapshot& snapshot, const QObject& object, const QString& called) {
  const QString name = called + '.';
  const QMetaObject& meta = *object.metaObject();
  for (int i = 0; i < meta.propertyCount(); ++i) {
    snapshot[name + meta.property(i).name()] = comparable(meta.property(i).read(&object));
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

/// True for the parts of a document, which Qt makes again for each text.
inline bool isPartOfDocument(const QObject& object) {
  const QByteArray name = object.metaObject()->className();
  return !object.isWidgetType() && (name.startsWith("QText") || name == "QWidgetTextControl");
}

/// True for a part of Qt's widgets that is not needed, and for what is in it: a scroll bar, a
/// button that scrolls tabs, a button for which a tool bar has no room. Qt places them when they
/// are.
inline bool isSparePart(const QObject& object) {
  static const QStringList names = {"qt_scrollarea_hcontainer", "qt_scrollarea_vcontainer",
                                    "ScrollLeftButton", "ScrollRightButton"};
  const QObject* const around = object.parent();
  const bool isHidden = object.isWidgetType() && static_cast<const QWidget&>(object).isHidden();
  const bool isPart = names.contains(object.objectName()) || qobject_cast<const QToolBar*>(around);
  return (isHidden && isPart) || (around && isSparePart(*around));
}

/// Returns the objects in the window, and the window. Reading one may make or delete others.
inline QList<QPointer<QObject>> objectsOf(QWidget& window) {
  const auto found = window.findChildren<QObject*>();
  QList<QPointer<QObject>> objects(found.begin(), found.end());
  objects.prepend(&window);
  objects.removeIf(
      [](const auto& object) { return isPartOfDocument(*object) || isSparePart(*object); });
  return objects;
}

/// Returns a name that no other object has.
inline QString nameOf(const QObject& object) {
  return QString("%1 \"%2\" %3")
      .arg(object.metaObject()->className(), object.objectName())
      .arg(reinterpret_cast<quintptr>(&object), 0, 16);
}

/// Returns everything that `addTo` adds for the window and all objects in it.
inline Snapshot pictureOfAll(QWidget& window) {
  Snapshot snapshot;
  for (const QPointer<QObject>& object : objectsOf(window)) {
    if (object) addTo(snapshot, *object, nameOf(*object));
  }
  return snapshot;
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
