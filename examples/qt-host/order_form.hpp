// SPDX-License-Identifier: MIT
// The application's own window: it orders parcels. It knows nothing of walk-throughs except the
// tags by which scripts name its controls.
#pragma once

#include <QCheckBox>
#include <QLabel>
#include <QLineEdit>
#include <QMainWindow>
#include <QPushButton>
#include <QSpinBox>
#include <QTabWidget>
#include <QTableWidget>

class OrderForm : public QMainWindow {
  Q_OBJECT

 public:
  OrderForm();

  QTabWidget& tabs = *new QTabWidget;
  // The first tab.
  QLineEdit& name = *new QLineEdit;
  QLineEdit& city = *new QLineEdit;
  QSpinBox& parcels = *new QSpinBox;
  QCheckBox& express = *new QCheckBox(tr("E&xpress"));
  QCheckBox& insured = *new QCheckBox(tr("&Insured"));
  QLabel& price = *new QLabel;
  QPushButton& clear = *new QPushButton(tr("C&lear"));
  // The second tab.
  QTableWidget& orders = *new QTableWidget(0, 3);
  QPushButton& cancel = *new QPushButton(tr("&Cancel this order"));
  // In the tool bar.
  QAction* order = nullptr;

 private:
  void addToolBarWithOrder();
  void addFormPage();
  void addOrdersPage();
  void react();
  void giveTags();

  void showPrice();
  void placeOrder();
  void clearAll();
};
