// SPDX-License-Identifier: MIT
// The host's own window: an order form for parcels. It knows nothing of walk-throughs except the
// tags by which scripts name its controls.
#pragma once

#include <QCheckBox>
#include <QComboBox>
#include <QLabel>
#include <QLineEdit>
#include <QMainWindow>
#include <QPlainTextEdit>
#include <QPushButton>
#include <QSpinBox>

class OrderForm : public QMainWindow {
 public:
  OrderForm();

  QLineEdit name;
  QLineEdit street;
  QLineEdit city;
  QComboBox country;
  QSpinBox parcels;
  QCheckBox express{"E&xpress"};
  QCheckBox insured{"&Insured"};
  QPlainTextEdit remarks;
  QLabel price;
  QPushButton order{"&Order"};
  QPushButton clear{"&Clear"};
  // At the lower edge; hidden unless a walk-through shows them.
  QLabel guide;
  QLabel picture;
  QPushButton next{"&Next"};

 private:
  void showPrice();
  void placeOrder();
  void clearAll();
};
