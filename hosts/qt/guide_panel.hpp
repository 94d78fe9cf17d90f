// SPDX-License-Identifier: MIT
// The guide's panel: its controls and its keys.
#pragma once

#include <QDialog>
#include <QGridLayout>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <functional>
#include <vector>

#include "qz/hosts/qt/guide.hpp"

namespace qz::hosts::qt {

/// A label that takes no room while it is empty. A hidden one would not report its changes to the
/// layout.
class GuideLabel final : public QLabel {
 public:
  using QLabel::QLabel;

  /// True if it shows something to the user.
  bool speaks() const { return !isHidden() && !isEmpty(); }
  /// Returns its words without attributes.
  QString words() const;

  QSize sizeHint() const override { return isEmpty() ? QSize(0, 0) : QLabel::sizeHint(); }
  QSize minimumSizeHint() const override {
    return isEmpty() ? QSize(0, 0) : QLabel::minimumSizeHint();
  }
  int heightForWidth(int width) const override {
    return isEmpty() ? 0 : QLabel::heightForWidth(width);
  }

 private:
  bool isEmpty() const { return text().isEmpty() && pixmap(Qt::ReturnByValue).isNull(); }
};

class GuidePanel final : public QDialog {
 public:
  /// The panel is a part of the form's window for commands.
  GuidePanel(QWidget& form, const GuideOptions& options);

  /// True if the panel has something to show.
  bool speaks() const { return heading.speaks() || text.speaks() || picture.speaks(); }
  /// True if the user can press Next.
  bool canGoOn() const { return !next.isHidden() && next.isEnabled(); }
  /// Takes all contents off.
  void clear();
  /// Hides the panel for ever. Commands no longer find its controls.
  void retire();
  /// Gives the panel the size that its contents need, within `bounds`.
  void fit(const QSize& bounds);
  /// Gives the focus to the first or the last button that takes it, or else to the panel.
  void focus(bool first);
  bool hasFocusInside() const;

  GuideLabel heading{this};
  GuideLabel text{this};
  GuideLabel picture{this};
  GuideLabel progress{this};
  QLineEdit target{this};
  QPushButton skip{this};
  QPushButton back{this};
  QPushButton next{this};

  /// Moves the focus to the form, to what follows (true) or precedes the panel; gives NO if it
  /// cannot.
  std::function<bool(bool forward)> leave = [](bool) { return false; };

  /// Escape, and the desktop's way of closing a window.
  void reject() override;

 protected:
  bool focusNextPrevChild(bool forward) override;
  void paintEvent(QPaintEvent* event) override;

 private:
  void setUp(QWidget& widget, const char* name, toolkit::Tag tag);
  void layOut();
  void stayInside();
  std::vector<QPushButton*> stops();
  int widthFor(int bound) const;

  const bool escapes_;
  QGridLayout grid_{this};
  QHBoxLayout buttons_;
};

}  // namespace qz::hosts::qt
