// SPDX-License-Identifier: MIT
// Leads the Tab key from a form into the guide's panel and back.
#pragma once

#include <QObject>
#include <QPointer>

class QWidget;

namespace qz::hosts::qt {

class GuidePanel;

/// Makes the visible panel follow its target in the order of the Tab key, without changing the
/// form's own order. Without a target, or with one that the key cannot reach, the panel follows
/// what precedes it, or the widget with the form's focus.
class GuideTabOrder final : public QObject {
 public:
  GuideTabOrder(QWidget& form, GuidePanel& panel);

  void setTarget(QWidget* target) { target_ = target; }
  bool eventFilter(QObject* receiver, QEvent* event) override;

 private:
  bool leave(bool next);
  void listenTo(QWidget* focused);
  QWidget* before() const;
  QWidget* after() const;

  const QPointer<QWidget> form_;
  const QPointer<GuidePanel> panel_;
  QPointer<QWidget> target_;
  QPointer<QWidget> focused_;  // in the form
};

}  // namespace qz::hosts::qt
