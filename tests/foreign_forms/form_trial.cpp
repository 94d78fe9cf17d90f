// SPDX-License-Identifier: MIT
// One form at a time: how it was, the walk-through, how it is.

#include "tests/foreign_forms/form_trial.hpp"

#include <QAbstractButton>
#include <QAccessible>
#include <QApplication>
#include <QDialogButtonBox>
#include <QFile>
#include <QStackedWidget>
#include <QTabWidget>
#include <QTemporaryDir>
#include <QTimer>
#include <QToolBar>
#include <QToolBox>
#include <QToolButton>
#include <QUiLoader>
#include <QXmlStreamReader>
#include <fstream>
#include <set>

#include "qz/hosts/qt/walk_through.hpp"
#include "tests/foreign_forms/form_script.hpp"
#include "tests/qt/snapshots.hpp"

namespace qz::foreign_forms {

namespace {

using hosts::Snapshot;

// Layouts inside layouts need several turns of the event loop.
void settle() {
  for (int level = 0; level < 5; ++level) {
    QCoreApplication::processEvents();
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
  }
}

template <class Pages>
void turnPages(QWidget& window) {
  for (auto* const pages : window.findChildren<Pages*>()) {
    const int current = pages->currentIndex();
    for (int i = 0; i < pages->count(); ++i) {
      pages->setCurrentIndex(i);
      settle();
    }
    pages->setCurrentIndex(current);
    settle();
  }
}

/// Qt lays a page out when it is shown for the first time.
void showEveryPage(QWidget& window) {
  turnPages<QTabWidget>(window);
  turnPages<QStackedWidget>(window);
  turnPages<QToolBox>(window);
}

/// A slot that counts.
class Ear : public QObject {
  Q_OBJECT
 public:
  int heard = 0;
 public slots:
  void hear() { ++heard; }
};

const QMetaMethod& slotOfEar() {
  static const QMetaMethod slot =
      Ear::staticMetaObject.method(Ear::staticMetaObject.indexOfSlot("hear()"));
  return slot;
}

/// Calls `visit` for each signal of the object.
template <class Visit>
void forEachSignal(const QObject& object, const Visit& visit) {
  const QMetaObject& meta = *object.metaObject();
  for (int i = 0; i < meta.methodCount(); ++i) {
    const QMetaMethod method = meta.method(i);
    const bool isClone = method.attributes() & QMetaMethod::Cloned;  // with default arguments
    if (method.methodType() == QMetaMethod::Signal && !isClone) visit(method);
  }
}

/// Returns the names of the widgets that a form declares.
std::set<QString> declaredWidgets(const QString& path) {
  std::set<QString> names;
  QFile file(path);
  if (!file.open(QIODevice::ReadOnly)) return names;
  QXmlStreamReader xml(&file);
  while (!xml.atEnd()) {
    if (xml.readNext() != QXmlStreamReader::StartElement || xml.name() != u"widget") continue;
    names.insert(xml.attributes().value("name").toString());
  }
  return names;
}

// Forms declare the buttons of these only by their roles and actions.
bool isStandardButton(const QWidget& widget) {
  if (!qobject_cast<const QAbstractButton*>(&widget)) return false;
  const auto* const bar = qobject_cast<QToolBar*>(widget.parentWidget());
  return qobject_cast<QDialogButtonBox*>(widget.parentWidget()) ||
         (bar && static_cast<const QToolButton&>(widget).defaultAction());
}

// The menu of a button is open until the user closes it.
void clickAndCloseMenu(QAbstractButton& button) {
  QTimer closer;
  QObject::connect(&closer, &QTimer::timeout, [] {
    if (QWidget* const menu = QApplication::activePopupWidget()) menu->close();
  });
  closer.start(0);
  button.click();
}

class Trial {
 public:
  Trial(std::unique_ptr<QWidget> form, std::set<QString> declared, Findings& findings);
  void run();

 private:
  void tagWidgets();
  void listen();
  void begin();
  void checkReached();
  void pressButtons();
  void undoChoicesOfUser();
  void checkTrace(bool withPresses);
  void checkConnections();
  void checkPressesOfHost();
  void mistake(const std::string& what) { findings_.mistakes.push_back(what); }
  std::string nameOf(const QWidget& widget) const;

  Findings& findings_;
  QTemporaryDir directory_;
  std::unique_ptr<QWidget> form_;
  const std::set<QString> declared_;
  std::vector<QWidget*> widgets_;
  QList<QPointer<QObject>> objects_;
  std::map<QAbstractButton*, int> clicks_;  // that the host has heard
  std::set<QAbstractButton*> chosen_;       // that were on at the beginning
  Ear ear_;
  Snapshot before_;
  toolkit::qt::QtToolkit toolkit_;
  hosts::qt::WalkThrough walkThrough_{toolkit_};
  std::vector<std::string> log_;
};

Trial::Trial(std::unique_ptr<QWidget> form, std::set<QString> declared, Findings& findings)
    : findings_(findings), form_(std::move(form)), declared_(std::move(declared)) {
  toolkit_.log().setSink([this](std::string_view line) { log_.emplace_back(line); });
  toolkit_.files().setResourcePath(directory_.path().toStdString());
  QImage image(20, 20, QImage::Format_RGB32);
  image.fill(Qt::red);
  image.save(directory_.filePath("picture.png"));
}

std::string Trial::nameOf(const QWidget& widget) const {
  return std::string(widget.metaObject()->className()) + " \"" + widget.objectName().toStdString() +
         "\"";
}

void Trial::run() {
  form_->show();
  form_->activateWindow();
  settle();
  showEveryPage(*form_);
  tagWidgets();
  listen();
  for (const auto& object : objects_) {
    if (object) QAccessible::queryAccessibleInterface(object);  // Qt listens for the end of each
  }
  hosts::pictureOfAll(*form_);  // makes what Qt makes when it is asked for the first time
  before_ = hosts::pictureOfAll(*form_);
  findings_.values = before_.size();
  for (const bool withPresses : {false, true}) {
    begin();
    checkReached();
    if (withPresses) pressButtons();
    form_->activateWindow();  // a menu may have taken its place
    walkThrough_.end();
    if (withPresses) undoChoicesOfUser();
    settle();
    showEveryPage(*form_);
    checkTrace(withPresses);
  }
  checkConnections();
  checkPressesOfHost();
}

void Trial::tagWidgets() {
  for (QWidget* const widget : form_->findChildren<QWidget*>()) {
    if (declared_.contains(widget->objectName()) || isStandardButton(*widget)) {
      widgets_.push_back(widget);
    }
  }
  for (std::size_t i = 0; i < widgets_.size(); ++i) {
    widgets_[i]->setProperty("qzTag", static_cast<int>(i + 1));
    ++findings_.classes[widgets_[i]->metaObject()->className()];
  }
  findings_.widgets = widgets_.size();
}

void Trial::listen() {
  objects_ = hosts::objectsOf(*form_);
  findings_.objects = static_cast<std::size_t>(objects_.size());
  for (const auto& object : objects_) {
    forEachSignal(*object, [&](const QMetaMethod& signal) {
      if (QObject::connect(object, signal, &ear_, slotOfEar())) ++findings_.connections;
    });
  }
  for (auto* const button : form_->findChildren<QAbstractButton*>()) {
    clicks_[button] = 0;
    if (button->isChecked()) chosen_.insert(button);
    QObject::connect(button, &QAbstractButton::clicked, &ear_,
                     [this, button] { ++clicks_[button]; });
  }
  findings_.buttons = clicks_.size();
}

void Trial::begin() {
  std::ofstream(directory_.filePath("tour.plist").toStdString()) << scriptFor(widgets_);
  if (!walkThrough_.play("tour.plist", *form_)) mistake("the walk-through does not begin");
  settle();
  for (const std::string& line : log_) {
    if (line.starts_with("No command")) findings_.unreached.push_back(line);
    if (line.starts_with("Exception")) mistake("log: " + line);
  }
  log_.clear();
}

void Trial::checkReached() {
  for (std::size_t i = 0; i < widgets_.size(); ++i) {
    const QString wanted = QString::fromStdString(tipAtStart(i + 1));
    if (widgets_[i]->toolTip() == wanted) continue;
    mistake("not reached: " + nameOf(*widgets_[i]));
  }
}

void Trial::pressButtons() {
  for (std::size_t i = 0; i < widgets_.size(); ++i) {
    auto* const button = qobject_cast<QAbstractButton*>(widgets_[i]);
    if (!button) continue;
    if (!button->isEnabled()) {
      findings_.unreached.push_back("Nobody can press " + nameOf(*button) +
                                    ": a plain widget around it is disabled");
      continue;
    }
    clickAndCloseMenu(*button);
    const std::string wanted = "Button tag " + std::to_string(i + 1) + " pressed.";
    if (log_ != std::vector{wanted}) mistake("press not recorded: " + nameOf(*button));
    for (const std::string& line : log_) {
      if (line != wanted) mistake("log: " + line);
    }
    log_.clear();
    if (button->toolTip().toStdString() != tipWhenPressed(i + 1)) {
      mistake("list not run: " + nameOf(*button));
    }
    if (clicks_[button] != 0) mistake("press heard by the host: " + nameOf(*button));
  }
}

// A press of a check box or a radio button is also a change by the user, which stays.
void Trial::undoChoicesOfUser() {
  for (QAbstractButton* const button : chosen_) button->setChecked(true);
  for (const auto& [button, clicks] : clicks_) {
    const bool wasExclusive = button->autoExclusive();
    button->setAutoExclusive(false);
    if (!chosen_.contains(button)) button->setChecked(false);
    button->setAutoExclusive(wasExclusive);
  }
}

// Qt lets the tabulator reach only the chosen one of radio buttons, as soon as one has the focus.
bool isQtsOwn(const QString& name) {
  return name.startsWith("QRadioButton") && name.endsWith(".focusPolicy");
}

// After presses, the host and Qt have reacted to what the user has chosen.
bool followsChoices(const QString& name) {
  return name.endsWith(".enabled") || name.endsWith(".focus") || name.endsWith("electedText");
}

void Trial::checkTrace(bool withPresses) {
  Snapshot after = hosts::pictureOfAll(*form_);
  for (const QString& name : hosts::differences(before_, after)) {
    if (isQtsOwn(name) || (withPresses && followsChoices(name))) continue;
    QString was;
    QString is;
    QDebug(&was) << before_[name];
    QDebug(&is) << after[name];
    mistake(name.toStdString() + " was " + was.toStdString() + ", is " + is.toStdString());
  }
}

void Trial::checkConnections() {
  for (const auto& object : objects_) {
    if (!object) {
      mistake("an object is gone");
      continue;
    }
    forEachSignal(*object, [&](const QMetaMethod& signal) {
      if (QObject::disconnect(object, signal, &ear_, slotOfEar())) return;
      mistake("connection lost: " + signal.methodSignature().toStdString());
    });
  }
}

void Trial::checkPressesOfHost() {
  for (auto& [button, clicks] : clicks_) {
    button->setEnabled(true);
    if (!button->isEnabled()) continue;
    clicks = 0;
    clickAndCloseMenu(*button);
    if (clicks != 1) mistake("press not heard by the host: " + nameOf(*button));
  }
}

}  // namespace

Findings tryForm(const QString& path) {
  Findings findings;
  QFile file(path);
  QUiLoader loader;
  std::unique_ptr<QWidget> form(file.open(QIODevice::ReadOnly) ? loader.load(&file) : nullptr);
  if (form) {
    Trial(std::move(form), declaredWidgets(path), findings).run();
  } else {
    findings.mistakes.push_back("not loaded: " + loader.errorString().toStdString());
  }
  return findings;
}

}  // namespace qz::foreign_forms

#include "form_trial.moc"
