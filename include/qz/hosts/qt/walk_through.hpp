// SPDX-License-Identifier: MIT
// Plays a walk-through in a Qt application, from beginning to end, with one call.
//
// Does the work common to all hosts: keeps the windows alive while a walk-through needs them, keeps
// a form open when the end of its walk-through would close it, takes a sheet off the screen, ends
// the walk-through when the user closes the window or dismisses the sheet, and tells how it goes.
#pragma once

#include <QByteArray>
#include <QLocale>
#include <QObject>
#include <QPointer>
#include <QString>
#include <QVariantMap>
#include <QWidget>
#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "qz/api.hpp"
#include "qz/engine.hpp"
#include "qz/hosts/qt/script_source.hpp"
#include "qz/progress_meter.hpp"
#include "qz/toolkit/qt/adoption.hpp"
#include "qz/toolkit/qt/qt_toolkit.hpp"

namespace qz::hosts::qt {

class Journal;
struct JournalStep;
struct ReadScript;

/// Plays one walk-through at a time: beginning another ends the previous one. It may be destroyed
/// at any moment, and so may the windows.
class QZ_API WalkThrough : public QObject {
  Q_OBJECT
  /// Whether a walk-through is running.
  Q_PROPERTY(bool running READ isRunning NOTIFY runningChanged)
  /// The key of the list that ran last; see `step()`.
  Q_PROPERTY(QString step READ step NOTIFY stepChanged)
  /// How much is done; see `progress()`.
  Q_PROPERTY(double progress READ progress NOTIFY progressChanged)

 public:
  /// Why a walk-through is over.
  enum class Reason {
    endedByScript,
    closedByUser,  ///< its window was closed or hidden
    replaced,      ///< another began
    hostGone,      ///< its window or the window's content was destroyed, or the application quits
    endedByHost    ///< `end` was called
  };
  Q_ENUM(Reason)

  /// Makes a toolkit of its own.
  explicit WalkThrough(QObject* parent = nullptr);
  /// Uses the host's toolkit, which must outlive this object.
  explicit WalkThrough(toolkit::qt::QtToolkit& toolkit, QObject* parent = nullptr);
  /// Ends the walk-through without a signal.
  ~WalkThrough() override;
  Q_DISABLE_COPY_MOVE(WalkThrough)

  /// Sets where relative paths of scripts start, and where images and fonts (.ttf, .otf) are looked
  /// for: a directory, or one of the program's resources, such as ":/tour". The fonts can be used
  /// until this object is destroyed.
  void setResources(const QString& directory);
  /// Sets the language of the scripts: instead of "tour.plist", "tour_de_AT.plist" or
  /// "tour_de.plist" is played if that file exists. By default that of `QLocale()`.
  void setLocale(const QLocale& locale) { locale_ = locale; }
  /// Sets how the following walk-throughs take over their windows: which widgets are the controls,
  /// and how they are treated.
  void setAdoption(toolkit::qt::Adoption adoption) { adoption_ = std::move(adoption); }
  /// Sets what measures the progress of the following walk-throughs; null for nothing.
  void setProgressMeter(std::shared_ptr<ProgressMeter> meter);
  /// Sets a function that is called after the end of every walk-through, when it no longer uses the
  /// widgets; the signal `finished` comes before.
  void whenOver(std::function<void()> told) { over_ = std::move(told); }

  /// Plays a script in a top-level widget, starting with the list of its smallest tag. If it cannot
  /// be played, gives NO, logs the reason and emits `failed`, and a running walk-through goes on.
  /// Reasons are: the file is missing or not a script, no key is a tag, the value under the
  /// smallest tag is not a list, lists run each other endlessly, or another walk-through is
  /// beginning.
  bool play(const ScriptSource& script, QWidget& window);
  /// The same in `panel`, a top-level widget, which is shown as a sheet over `window`.
  bool playInSheet(const ScriptSource& script, QWidget& panel, QWidget& window);

  /// Returns where the walk-through is, for `resume`: the running one, or else the last one unless
  /// its script ended it. Has the keys "version", "script" and "steps" (a list of strings); all
  /// that settings can keep. Empty if no walk-through can be resumed.
  QVariantMap state() const;
  /// Plays the script of a state, and makes its steps again at once. The timers of the last step
  /// start again from the beginning. Fails like `play`, and also if the script no longer has a list
  /// that the state needs.
  bool resume(const QVariantMap& state, QWidget& window);
  /// The same in `panel`, a top-level widget, which is shown as a sheet over `window`.
  bool resumeInSheet(const QVariantMap& state, QWidget& panel, QWidget& window);

  /// Returns a description of a top-level widget, as a walk-through sees it, for the option
  /// `--window` of `qz-walkthrough`: an XML property list that docs/host-windows.md explains. The
  /// widget may be in a walk-through.
  QByteArray describe(QWidget& window);

  /// Ends the walk-through, if one is running. A walk-through also ends when its window is closed,
  /// hidden (as a dialog is by its buttons and Escape, even if it is shown again at once) or
  /// destroyed, when its main window gets another central widget, and when the application quits.
  void end() { finish(Reason::endedByHost); }

  /// Whether a walk-through is running.
  bool isRunning() const { return engine_ != nullptr; }
  /// Returns the key of the list that the start, a press or a timer ran last; empty before the
  /// first.
  const QString& step() const { return step_; }
  /// Returns the share of the shortest way to the end that is done, from 0 to 1; -1 if it is not
  /// known, as without a progress meter.
  double progress() const { return progress_; }
  /// Returns the engine; null if no walk-through is running. Its observer is this object's.
  const std::shared_ptr<QZ_Plist_State_Parser>& engine() const { return engine_; }
  /// Returns the toolkit of the walk-throughs: the host's, or else this object's own.
  toolkit::qt::QtToolkit& toolkit() { return toolkit_; }

 Q_SIGNALS:
  /// A walk-through has begun; its first list has run.
  void started();
  /// The start, a press or a timer has run the list under `key`. Comes from the event loop.
  void stepChanged(const QString& key);
  /// The walk-through is over and no longer uses the widgets.
  void finished(qz::hosts::qt::WalkThrough::Reason reason);
  /// A script was not played, or a command of the running one has raised. The log says the same.
  void failed(const QString& what);
  /// The property `progress` has another value.
  void progressChanged(double progress);
  /// A walk-through has begun, or the running one is over.
  void runningChanged();

 private:
  class Watch;

  struct Beginning;

  WalkThrough(std::shared_ptr<toolkit::qt::QtToolkit> toolkit, QObject* parent);
  bool begin(const ScriptSource& source, QWidget& stage, QWidget& window,
             const QVariantMap* resumed);
  void run(const ReadScript& script, const std::vector<JournalStep>& steps, bool isSheet);
  bool refuse(const QString& script, const std::string& reason);
  void finish(Reason reason);
  static void endWithApplication();
  void tellStep();
  void noteStep(toolkit::Tag key);
  void noteFailure(const std::string& what);
  void measureSoon();
  void measure();
  void setProgress(double progress);

  std::shared_ptr<toolkit::qt::QtToolkit> own_;  // null if the host has one
  toolkit::qt::QtToolkit& toolkit_;
  toolkit::qt::Adoption adoption_;
  std::optional<QLocale> locale_;
  std::shared_ptr<ProgressMeter> meter_;
  std::vector<int> fonts_;  // those of the resources, by their numbers in Qt's database
  // Kept alive while the engine runs: the window given to it, and the one with the controls.
  toolkit::Ref<toolkit::Window> parent_;
  std::unique_ptr<toolkit::qt::AdoptedWindow> adopted_;
  std::shared_ptr<QZ_Plist_State_Parser> engine_;
  std::shared_ptr<Watch> watch_;
  std::shared_ptr<Journal> journal_;  // kept after the end, for `state`
  QVariant script_;                   // of the journal
  QString step_;
  double progress_ = -1;
  std::function<void()> over_;
  bool isBeginning_ = false;
};

}  // namespace qz::hosts::qt
