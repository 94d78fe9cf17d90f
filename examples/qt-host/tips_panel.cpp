// SPDX-License-Identifier: MIT
// Lays out the panel by hand.
#include "tips_panel.hpp"

#include <QGridLayout>

TipsPanel::TipsPanel() {
  setWindowTitle(tr("Tips"));
  auto* const grid = new QGridLayout(this);
  grid->addWidget(&heading, 0, 0, 1, 3);
  grid->addWidget(&tip, 1, 0, 1, 3);
  grid->addWidget(&next, 2, 1);
  grid->addWidget(&close, 2, 2);
  grid->setRowStretch(1, 1);
  grid->setColumnStretch(0, 1);
  tip.setWordWrap(true);
  tip.setAlignment(Qt::AlignTop | Qt::AlignLeading);
  heading.setProperty("qzTag", 1);
  tip.setProperty("qzTag", 2);
  next.setProperty("qzTag", 10);
  close.setProperty("qzTag", 99);
  resize(360, 180);
}
