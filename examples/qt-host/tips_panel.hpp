// SPDX-License-Identifier: MIT
// A panel with tips, which the host shows as a sheet.
#pragma once

#include <QLabel>
#include <QPushButton>
#include <QWidget>

class TipsPanel : public QWidget {
 public:
  TipsPanel();

  QLabel heading;
  QLabel tip;
  QPushButton next{"&Next tip"};
  QPushButton close{"&Close"};
};
