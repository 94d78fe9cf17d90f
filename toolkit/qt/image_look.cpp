// SPDX-License-Identifier: MIT
// Images in labels, and behind the subviews of a view.

#include "toolkit/qt/image_look.hpp"

#include <QEvent>
#include <QLabel>
#include <QPainter>
#include <QPixmap>

#include "toolkit/qt/decoration.hpp"
#include "toolkit/qt/images.hpp"
#include "toolkit/qt/label_page.hpp"
#include "toolkit/qt/strings.hpp"

namespace qz::toolkit::qt {

namespace {

const QtImage* drawable(const Ref<Image>& image) {
  const auto* const known = dynamic_cast<const QtImage*>(image.pointer().get());
  return known && !known->size().isEmpty() ? known : nullptr;
}

/// Returns `frame` shrunk to the image's proportions and centred.
QRect placeFor(const QtImage& image, const QRect& frame) {
  QSizeF size = image.size();
  if (size.width() > frame.width() || size.height() > frame.height()) {
    size.scale(frame.size(), Qt::KeepAspectRatio);
  }
  QRect place(QPoint(), size.toSize().expandedTo({1, 1}));
  place.moveCenter(frame.center());
  return place;
}

/// Draws a label's image instead of the label, which would clip or distort it.
class ImageLook final : public QObject {
 public:
  explicit ImageLook(QLabel& label) : QObject(&label), label_(label) {
    label.installEventFilter(this);
  }

  void show(const Ref<Image>& image) {
    const QString formerName = qString(image_->name());
    image_ = image;
    const QtImage* const known = drawable(image);
    // The label keeps the pixmap too, for its size hint and for callers that ask for it.
    label_.setPixmap(known ? known->pixmap() : QPixmap());
    shownKey_ = label_.pixmap(Qt::ReturnByValue).cacheKey();
    describe(formerName, qString(image->name()));
    label_.update();
  }

  bool isStale() const { return label_.pixmap(Qt::ReturnByValue).cacheKey() != shownKey_; }
  const Ref<Image>& image() const { return image_; }

  bool eventFilter(QObject*, QEvent* event) override {
    if (event->type() != QEvent::Paint || isStale()) return false;
    QPainter painter(&label_);
    drawFrame(label_, painter);
    const int margin = label_.margin();
    const QRect frame = label_.contentsRect().adjusted(margin, margin, -margin, -margin);
    if (!label_.isEnabled()) painter.setOpacity(0.5);
    if (const QtImage* const known = drawable(image_)) {
      drawImage(painter, placeFor(*known, frame), *known);
    }
    return true;
  }

 private:
  /// Makes the image's name the label's accessible description, and its accessible name too unless
  /// the host has set one.
  void describe(const QString& formerName, const QString& name) {
    label_.setAccessibleDescription(name);
    const QString called = label_.accessibleName();
    if (called.isEmpty() || called == formerName) label_.setAccessibleName(name);
  }

  QLabel& label_;  // its parent
  Ref<Image> image_;
  qint64 shownKey_ = 0;
};

/// Draws a view's layer beneath the view's own drawing.
class Layer final : public QObject {
 public:
  explicit Layer(QWidget& widget) : QObject(&widget), widget_(widget) {
    widget.installEventFilter(this);
  }

  void show(const Ref<Image>& contents) {
    contents_ = contents;
    widget_.update();
  }
  const Ref<Image>& contents() const { return contents_; }

  bool eventFilter(QObject*, QEvent* event) override {
    const QtImage* const known = drawable(contents_);
    if (event->type() == QEvent::Paint && known) {
      QPainter painter(&widget_);
      drawImage(painter, widget_.rect(), *known);
    }
    return false;
  }

 private:
  QWidget& widget_;  // its parent
  Ref<Image> contents_;
};

}  // namespace

void showImage(QLabel& label, const Ref<Image>& image) {
  if (!image && !decorationOn<ImageLook>(label)) return label.setPixmap({});
  auto& look = decorated<ImageLook>(label);
  look.show(image);
  if (!image) delete &look;
}

Ref<Image> shownImage(const QLabel& label) {
  const auto* const look = decorationOn<ImageLook>(label);
  return look && !look->isStale() ? look->image() : Ref<Image>();
}

void dropImage(QLabel& label) { delete decorationOn<ImageLook>(label); }

void setLayered(QWidget& widget, bool layered) {
  if (layered) {
    decorated<Layer>(widget);
  } else {
    delete decorationOn<Layer>(widget);
    widget.update();
  }
}

bool isLayered(const QWidget& widget) { return decorationOn<Layer>(widget) != nullptr; }

void showLayerContents(QWidget& widget, const Ref<Image>& image) {
  if (auto* const layer = decorationOn<Layer>(widget)) layer->show(image);
}

Ref<Image> layerContents(const QWidget& widget) {
  const auto* const layer = decorationOn<Layer>(widget);
  return layer ? layer->contents() : Ref<Image>();
}

}  // namespace qz::toolkit::qt
