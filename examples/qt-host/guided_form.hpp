// SPDX-License-Identifier: MIT
// The window with walk-throughs in its Help menu: one in a guide beside the controls, one in a
// sheet.
#pragma once

#include <QMenuBar>

#include "order_form.hpp"
#include "qz/hosts/qt/guide.hpp"
#include "qz/hosts/qt/walk_through.hpp"
#include "tips_panel.hpp"

class GuidedForm final : public OrderForm {
  Q_OBJECT

 public:
  GuidedForm() {
    walkThrough.setResources(":/tour");
    QMenu* const help = menuBar()->addMenu(tr("&Help"));
    help->addAction(tr("Show me &around"), [this] { walkThrough.play("tour.plist", *this); });
    help->addAction(tr("&Tips"), [this] { walkThrough.playInSheet("tips.plist", tips, *this); });
  }

  TipsPanel tips;
  qz::hosts::qt::WalkThrough walkThrough;
  qz::hosts::qt::Guide guide{walkThrough.toolkit(), *this};
};
