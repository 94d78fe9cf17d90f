// SPDX-License-Identifier: MIT
// The end of a walk-through is noticed inside the engine or inside an event of the window.
// Destroying these objects there would be unsafe, so the clean-up runs later, from Qt's event loop.
// Signals that report what the engine does come from there too. Any function of the host may
// destroy this object, so nothing is used after a call of one without being looked at again.

#include "qz/hosts/qt/walk_through.hpp"

#include <QCoreApplication>
#include <QEvent>
#include <QMainWindow>
#include <set>
#include <utility>

#include "hosts/qt/description.hpp"
#include "hosts/qt/journal.hpp"
#include "hosts/qt/outline.hpp"
#include "hosts/qt/resource_fonts.hpp"
#include "hosts/qt/resumption.hpp"
#include "hosts/qt/script_reading.hpp"

namespace qz::hosts::qt {

namespace {

// No file can have this path: an engine that loads it keeps the script that it has.
constexpr const char* noFile = "/dev/null/no-script";

// Returns the widget that holds the controls.
QWidget* contentOf(QWidget& window) {
  const auto* const mainWindow = qobject_cast<const QMainWindow*>(&window);
  return mainWindow ? mainWindow->centralWidget() : &window;
}

// All that live. They end with the application, which may be destroyed before them.
std::set<WalkThrough*>& livingWalkThroughs() {
  static std::set<WalkThrough*> all;
  return all;
}

}  // namespace

class WalkThrough::Watch final : public QObject, public toolkit::SheetDelegate {
 public:
  Watch(WalkThrough& owner, QWidget& stage)
      : owner_(owner),
        engine_(owner.engine_),
        stage_(&stage),
        content_(contentOf(stage)),
        hasContent_(content_) {
    watch(stage);
    if (content_ && content_ != &stage) watch(*content_);
  }

  bool isFor(const QWidget& window) const { return stage_ == &window; }

  void sheetDidEnd(const toolkit::Ref<toolkit::Window>& sheet, long, void*) override {
    sheet->orderOut();
    endSoon();
  }

  bool eventFilter(QObject* receiver, QEvent* event) override {
    const auto type = event->type();
    const bool isClosing = type == QEvent::Close && receiver == stage_;
    if (type == QEvent::Hide && receiver == stage_) noteHiding(*event);
    if (isClosing || type == QEvent::Hide || type == QEvent::ParentChange) endSoon();
    if (!isClosing || !isOver()) return false;
    event->ignore();  // the walk-through closes the window, not the user
    return true;
  }

 private:
  void watch(QWidget& widget) {
    widget.installEventFilter(this);
    connect(&widget, &QObject::destroyed, this, [this] { endSoon(); });
  }

  // Remembers a dismissal, even if the window is shown again at once. Ignores windows that the
  // desktop minimises, and a panel that the toolkit hides briefly to make it a sheet.
  void noteHiding(const QEvent& event) {
    isDismissed_ |= !event.spontaneous() && !owner_.isBeginning_;
  }

  bool isOver() const { return engine_->terminating(); }

  bool stageIsGone() const { return isDismissed_ || !stage_->isVisible(); }
  bool contentIsGone() const {
    return !stage_ || (hasContent_ && (!content_ || contentOf(*stage_) != content_));
  }

  std::optional<Reason> reasonToEnd() const {
    if (isOver()) return Reason::endedByScript;
    if (contentIsGone()) return Reason::hostGone;
    return stageIsGone() ? std::optional(Reason::closedByUser) : std::nullopt;
  }

  // If the host refuses the close, the walk-through continues.
  void endSoon() {
    const auto endIfOver = [this] {
      if (const auto reason = reasonToEnd()) owner_.finish(*reason);
    };
    QMetaObject::invokeMethod(this, endIfOver, Qt::QueuedConnection);
  }

  WalkThrough& owner_;
  const std::shared_ptr<QZ_Plist_State_Parser> engine_;
  QPointer<QWidget> stage_;
  QPointer<QWidget> content_;
  bool hasContent_;  // whether it had content at the beginning
  bool isDismissed_ = false;
};

/// Marks that a walk-through begins.
struct WalkThrough::Beginning {
  explicit Beginning(WalkThrough& walkThrough) : owner(&walkThrough) { owner->isBeginning_ = true; }
  ~Beginning() {
    if (owner) owner->isBeginning_ = false;
  }
  Beginning(const Beginning&) = delete;
  Beginning& operator=(const Beginning&) = delete;

  QPointer<WalkThrough> owner;
};

WalkThrough::WalkThrough(QObject* parent)
    : WalkThrough(std::make_shared<toolkit::qt::QtToolkit>(), parent) {}

WalkThrough::WalkThrough(std::shared_ptr<toolkit::qt::QtToolkit> toolkit, QObject* parent)
    : WalkThrough(*toolkit, parent) {
  own_ = std::move(toolkit);
}

WalkThrough::WalkThrough(toolkit::qt::QtToolkit& toolkit, QObject* parent)
    : QObject(parent), toolkit_(toolkit) {
  // Qt forgets the routine when it has called it.
  if (livingWalkThroughs().empty()) qAddPostRoutine(endWithApplication);
  livingWalkThroughs().insert(this);
  connect(qApp, &QCoreApplication::aboutToQuit, this, [this] { finish(Reason::hostGone); });
}

// The end of one may destroy another.
void WalkThrough::endWithApplication() {
  auto& living = livingWalkThroughs();
  while (!living.empty()) living.extract(living.begin()).value()->finish(Reason::hostGone);
}

// A list that is running still uses the toolkit.
WalkThrough::~WalkThrough() {
  over_ = nullptr;  // the callback's object may be half destroyed
  blockSignals(true);
  livingWalkThroughs().erase(this);
  if (livingWalkThroughs().empty()) qRemovePostRoutine(endWithApplication);
  const bool isInsideStep = journal_ && journal_->isInsideStep();
  end();
  removeFonts(fonts_);
  auto* const application = QCoreApplication::instance();
  if (own_ && isInsideStep && application) {
    QMetaObject::invokeMethod(
        application, [kept = own_] {}, Qt::QueuedConnection);
  }
}

void WalkThrough::setResources(const QString& directory) {
  toolkit_.files().setResourcePath(directory.toStdString());
  removeFonts(fonts_);
  fonts_ = addFontsIn(QString::fromStdString(toolkit_.files().resourcePath()));
}

void WalkThrough::setProgressMeter(std::shared_ptr<ProgressMeter> meter) {
  if (meter_) meter_->end();
  meter_ = std::move(meter);
}

bool WalkThrough::play(const ScriptSource& script, QWidget& window) {
  return begin(script, window, window, nullptr);
}

bool WalkThrough::playInSheet(const ScriptSource& script, QWidget& panel, QWidget& window) {
  return begin(script, panel, window, nullptr);
}

QVariantMap WalkThrough::state() const {
  return journal_ ? stateOf(script_, journal_->steps()) : QVariantMap();
}

bool WalkThrough::resume(const QVariantMap& state, QWidget& window) {
  return resumeInSheet(state, window, window);
}

bool WalkThrough::resumeInSheet(const QVariantMap& state, QWidget& panel, QWidget& window) {
  if (state.isEmpty()) return refuse("(none)", "the state to resume is empty");
  return begin(ScriptSource::fromVariant(state["script"]), panel, window, &state);
}

// A window can be adopted only once.
QByteArray WalkThrough::describe(QWidget& window) {
  const bool isAdopted = watch_ && watch_->isFor(*window.window());
  if (isAdopted) return descriptionOf(adopted_->window());
  const toolkit::qt::AdoptedWindow adopted(toolkit_, window, adoption_);
  return descriptionOf(adopted.window());
}

// Says why the walk-through is not played; gives NO.
bool WalkThrough::refuse(const QString& script, const std::string& reason) {
  const std::string what = "The walk-through " + script.toStdString() + " is not played: " + reason;
  toolkit_.log().write(what);
  Q_EMIT failed(QString::fromStdString(what));
  return false;
}

bool WalkThrough::begin(const ScriptSource& source, QWidget& stage, QWidget& window,
                        const QVariantMap* resumed) {
  if (isBeginning_) return refuse(source.name(), "another walk-through is beginning");
  const Beginning beginning(*this);
  const ReadScript script = readScript(source, toolkit_.files(), locale_.value_or(QLocale()));
  if (!script.problem.empty()) return refuse(source.name(), script.problem);
  const Resumption resumption = resumed ? resumptionOf(*resumed, *script.lists) : Resumption();
  if (!resumption.problem.empty()) return refuse(source.name(), resumption.problem);
  const QPointer<QWidget> place(&stage);
  const QPointer<QWidget> over(&window);
  finish(Reason::replaced);
  if (!beginning.owner || !place || !over) return false;
  script_ = source.toVariant();
  parent_ = toolkit_.application().window(window);
  engine_ = QZ_Plist_State_Parser::initWithWindow(toolkit_, parent_);
  adopted_ = std::make_unique<toolkit::qt::AdoptedWindow>(toolkit_, stage, adoption_);
  watch_ = std::make_shared<Watch>(*this, stage);
  step_.clear();
  run(script, resumption.steps, &stage != &window);
  const auto goesOn = [&] {
    return beginning.owner && engine_;
  };  // a list can make the host end it
  if (goesOn()) setProgress(-1);
  if (goesOn()) Q_EMIT runningChanged();
  if (goesOn()) Q_EMIT started();
  if (goesOn()) tellStep();
  return true;
}

void WalkThrough::run(const ReadScript& script, const std::vector<JournalStep>& steps,
                      bool isSheet) {
  const auto engine = engine_;
  const auto watch = watch_;
  journal_ = std::make_shared<Journal>(
      Journal::Listener{.pressed = [this] { measureSoon(); },
                        .stepped = [this](toolkit::Tag key) { noteStep(key); },
                        .failed = [this](const std::string& what) { noteFailure(what); }});
  engine->getGuiAssetsFromWindow(adopted_->window());
  engine->setPlistDictionary(script.lists->copy(toolkit::Mutability::changeable));
  engine->setObserver(journal_);
  if (meter_) {
    meter_->begin(script.bytes, outlineOf(*engine), [context = watch.get(), this] {
      QMetaObject::invokeMethod(
          context, [this] { measure(); }, Qt::QueuedConnection);
    });
  }
  toolkit_.calls().make([&] {
    const auto start = steps.empty() ? std::optional<std::string>("") : std::nullopt;
    engine->loadPlist(noFile, start, watch, isSheet);
    for (const JournalStep& step : steps) {
      if (!engine->terminating()) repeat(step, *engine);
    }
  });
}

// While a walk-through begins only its last step is told, after `started`.
void WalkThrough::noteStep(toolkit::Tag key) {
  step_ = QString::number(key);
  if (!isBeginning_) tellStep();
}

void WalkThrough::tellStep() {
  if (!engine_) return;
  const auto tell = [this, key = step_] {
    const QPointer<WalkThrough> self(this);
    Q_EMIT stepChanged(key);
    if (self) measure();
  };
  QMetaObject::invokeMethod(watch_.get(), tell, Qt::QueuedConnection);
}

void WalkThrough::noteFailure(const std::string& what) {
  const auto tell = [this, what = QString::fromStdString(what)] { Q_EMIT failed(what); };
  QMetaObject::invokeMethod(watch_.get(), tell, Qt::QueuedConnection);
}

// After the press of a button without a list, which cancels the timers.
void WalkThrough::measureSoon() {
  if (!watch_ || !meter_) return;
  QMetaObject::invokeMethod(
      watch_.get(), [this] { measure(); }, Qt::QueuedConnection);
}

void WalkThrough::measure() {
  if (!engine_ || engine_->terminating() || !meter_) return;
  setProgress(meter_->share(outlineOf(*engine_)).value_or(-1));
}

void WalkThrough::setProgress(double progress) {
  if (std::exchange(progress_, progress) != progress) Q_EMIT progressChanged(progress);
}

// What the walk-through has is taken away from this object first: the end of the engine and the
// restoring of the widgets can call functions of the host.
void WalkThrough::finish(Reason reason) {
  if (!engine_) return;
  const QPointer<WalkThrough> self(this);
  const auto kept = own_;
  const auto engine = std::exchange(engine_, nullptr);
  auto watch = std::exchange(watch_, nullptr);
  auto adopted = std::exchange(adopted_, nullptr);
  const auto parent = std::exchange(parent_, {});
  if (meter_) meter_->end();
  if (reason == Reason::endedByScript) journal_.reset();
  engine->setObserver(nullptr);
  if (!engine->terminating()) engine->terminateParser();
  watch.reset();
  adopted.reset();
  if (self && reason == Reason::endedByScript) setProgress(1);
  if (self) Q_EMIT runningChanged();
  if (self) Q_EMIT finished(reason);
  if (!self) return;
  if (const auto told = over_) told();
}

}  // namespace qz::hosts::qt
