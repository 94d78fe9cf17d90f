// SPDX-License-Identifier: MIT
// A panel with tips, which the application shows as a sheet.
#pragma once

#include <QLabel>
#include <QPushButton>
#include <QWidget>

class TipsPanel : public QWidget {
  Q_OBJECT

 public:
  TipsPanel();

  QLabel heading;
  QLabel tip;
  QPushButton next{tr("&Next tip")};
  QPushButton close{tr("&Close")};
};
