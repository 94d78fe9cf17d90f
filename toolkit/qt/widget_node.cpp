// SPDX-License-Identifier: MIT
// Presents the tree of widgets as a tree of views. Qt owns the widgets; a view without a superview,
// removed from it or not yet inserted, deletes its widget itself.

#include "toolkit/qt/widget_node.hpp"

#include <QEvent>
#include <QVariant>
#include <algorithm>
#include <utility>

#include "toolkit/backend/insertion.hpp"
#include "toolkit/qt/coordinates.hpp"
#include "toolkit/qt/focus.hpp"
#include "toolkit/qt/hiding.hpp"

namespace qz::toolkit::qt {

namespace {

/// True if `widgets` are exactly the subviews of `parent`, in their order.
bool areSubviewsOf(const QWidget& parent, const std::vector<QPointer<QObject>>& widgets) {
  auto next = widgets.begin();
  for (const QObject* const child : parent.children()) {
    if (!isSubview(child)) continue;
    if (next == widgets.end() || next->data() != child) return false;
    ++next;
  }
  return next == widgets.end();
}

}  // namespace

bool isSubview(const QObject* child) {
  return child && child->isWidgetType() && !static_cast<const QWidget*>(child)->isWindow();
}

// Watches for changes of the widget that this toolkit does not make.
class WidgetNode::Watch final : public QObject {
 public:
  explicit Watch(WidgetNode& node) : node_(node) { beFirst(); }

  /// Moves this filter before the one that takes over the widget's painting.
  void beFirst() { node_.widget_->installEventFilter(this); }

  bool eventFilter(QObject*, QEvent* event) override {
    if (event->type() == QEvent::Paint) node_.isRedrawPending_ = false;
    if (event->type() == QEvent::DynamicPropertyChange) node_.tag_.reset();
    return false;
  }

 private:
  WidgetNode& node_;  // its owner
};

WidgetNode::WidgetNode(QWidget& widget, std::shared_ptr<Desk> desk, KeptBy keptBy)
    : widget_(&widget),
      desk_(std::move(desk)),
      key_(&widget),
      keptBy_(keptBy),
      hadTag_(widget.property(tagProperty).isValid()),
      watch_(std::make_unique<Watch>(*this)) {}

// Deletes the widget later, because this may run during one of the widget's own events.
WidgetNode::~WidgetNode() {
  desk_->forgetView(key_);
  if (widget_ && keptBy_ == KeptBy::holder && !widget_->parentWidget()) widget_->deleteLater();
}

std::shared_ptr<WidgetNode> WidgetNode::of(const Ref<View>& view) {
  return std::dynamic_pointer_cast<WidgetNode>(view.pointer());
}

Ref<View> WidgetNode::view() { return std::shared_ptr<View>(shared_from_this(), &role()); }

std::string WidgetNode::nameOfClass() const {
  return widget_ ? widget_->metaObject()->className() : "";
}

Tag WidgetNode::readTag() const {
  if (!widget_) return 0;
  if (!tag_) {
    const QVariant own = widget_->property(tagProperty);
    tag_ = own.isValid() ? Tag{own.toLongLong()} : givenTag_;
  }
  return *tag_;
}

void WidgetNode::writeTag(Tag tag) {
  if (!widget_) return;
  const bool leavesNothing = tag == givenTag_ && !hadTag_;
  widget_->setProperty(tagProperty,
                       leavesNothing ? QVariant() : QVariant(static_cast<qlonglong>(tag)));
}

bool WidgetNode::isWhereItWasPut() const {
  if (!placement_) return false;
  const QWidget* const around = widget_->parentWidget();
  return !around || (placement_->geometry == widget_->geometry() &&
                     placement_->areaHeight == around->height());
}

Rect WidgetNode::readFrame() const {
  if (!widget_) return {};
  if (isWhereItWasPut()) return placement_->frame;
  const Rect geometry = exactly(widget_->geometry());
  if (widget_->isWindow()) return {0, 0, geometry.width, geometry.height};
  return flipped(geometry, widget_->parentWidget()->height());
}

void WidgetNode::place(const Rect& frame) {
  if (!widget_) return;
  const QWidget* const around = widget_->parentWidget();
  const int areaHeight = around ? around->height() : 0;
  widget_->setGeometry(rounded(flipped(frame, areaHeight)));
  placement_ = Placement{frame, widget_->geometry(), areaHeight};
  changed();
}

const Subviews& WidgetNode::readSubviews() {
  if (widget_ && areSubviewsOf(*widget_, listed_)) return subviews_;
  std::vector<QObject*> children;
  if (widget_) {
    for (QObject* const child : widget_->children()) {
      if (isSubview(child)) children.push_back(child);
    }
  }
  present(children);
  return subviews_;
}

void WidgetNode::present(const std::vector<QObject*>& objects) {
  Subviews fresh;
  for (QObject* const object : objects) fresh.push_back(desk_->viewOf(*object));
  listed_.assign(objects.begin(), objects.end());
  subviews_.swap(fresh);
}

bool WidgetNode::presents(const std::vector<QObject*>& objects) const {
  return std::equal(
      objects.begin(), objects.end(), listed_.begin(), listed_.end(),
      [](QObject* object, const QPointer<QObject>& listed) { return object == listed.data(); });
}

bool WidgetNode::presentsOnlyLiving() const {
  return std::none_of(listed_.begin(), listed_.end(),
                      [](const QPointer<QObject>& listed) { return listed.isNull(); });
}

void WidgetNode::joinForm(const std::shared_ptr<AdoptedForm>& form, Tag tag) {
  form_ = form;
  givenTag_ = tag;
  tag_.reset();
}

ViewChange WidgetNode::change(Aspect aspect, Notice notice) {
  return {widget_, form_.lock(), aspect, notice};
}

void WidgetNode::insert(const Ref<View>& view) {
  const auto node = of(view);
  const auto receiver = nameOfClass();
  requireOwnView(receiver, view, node != nullptr);
  if (!widget_ || !node->widget_) return;
  QWidget& added = *node->widget_;
  requireFreeView(receiver, added.isWindow() && node->keptBy_ == KeptBy::host,
                  &added == widget_ || added.isAncestorOf(widget_));

  // The reference may be an element of the list that the view now leaves.
  // NOLINTNEXTLINE(performance-unnecessary-copy-initialization)
  const Ref<View> kept = view;
  const Rect frame = node->readFrame();
  const bool hidden = node->isHidden();
  added.setParent(widget_);
  node->place(frame);
  added.raise();
  added.setVisible(!hidden);
  // Appended here so that it is owned; other changes of the list are noticed later.
  subviews_.push_back(kept);
  listed_.emplace_back(&added);
  changed();
}

void WidgetNode::removeFromSuperview() {
  if (!widget_ || !widget_->parentWidget()) return;
  const auto around = of(superview());
  const auto kept = shared_from_this();
  placement_ = Placement{readFrame(), {}, 0};
  hiddenOutside_ = widget_->isHidden();
  giveFocusAway(*widget_);
  widget_->setParent(nullptr);
  keptBy_ = KeptBy::holder;
  around->readSubviews();
  around->changed();
}

bool WidgetNode::isOutside() const { return keptBy_ == KeptBy::holder && !widget_->parentWidget(); }

bool WidgetNode::isHidden() const {
  if (!widget_) return false;
  return isOutside() ? hiddenOutside_ : isHiddenInForm(*widget_);
}

// Only remembers the state of a view without a superview: Qt would show it as a separate window.
void WidgetNode::hide(bool hidden) {
  if (!widget_) return;
  if (hidden) giveFocusAway(*widget_);
  if (isOutside()) {
    hiddenOutside_ = hidden;
  } else {
    setHiddenInForm(*widget_, hidden);
  }
  changed();
}

void WidgetNode::enable(bool enabled) {
  if (!widget_) return;
  if (!enabled) giveFocusAway(*widget_);
  widget_->setEnabled(enabled);
  changed();
}

void WidgetNode::changed() {
  if (!widget_ || isRedrawPending_) return;
  isRedrawPending_ = true;
  watch_->beFirst();
}

Ref<View> WidgetNode::superview() const {
  if (!widget_ || widget_->isWindow() || !widget_->parentWidget()) return {};
  return desk_->viewOf(*widget_->parentWidget());
}

}  // namespace qz::toolkit::qt
