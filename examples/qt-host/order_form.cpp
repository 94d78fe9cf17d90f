// SPDX-License-Identifier: MIT
// Lays out the form by hand, as Designer would.
#include "order_form.hpp"

#include <QGridLayout>
#include <QStatusBar>

namespace {

void tag(QWidget& widget, int tag) { widget.setProperty("qzTag", tag); }

void addRow(QGridLayout& grid, int row, const char* caption, QWidget& field) {
  auto* const label = new QLabel(caption);
  label->setBuddy(&field);
  grid.addWidget(label, row, 0);
  grid.addWidget(&field, row, 1, 1, 3);
}

}  // namespace

OrderForm::OrderForm() {
  setWindowTitle("Parcels");
  auto* const grid = new QGridLayout;
  addRow(*grid, 0, "N&ame", name);
  addRow(*grid, 1, "&Street", street);
  addRow(*grid, 2, "Ci&ty", city);
  addRow(*grid, 3, "Co&untry", country);
  addRow(*grid, 4, "&Parcels", parcels);
  addRow(*grid, 5, "&Remarks", remarks);
  grid->addWidget(&express, 6, 1);
  grid->addWidget(&insured, 6, 2);
  grid->addWidget(&price, 7, 1);
  grid->addWidget(&clear, 7, 2);
  grid->addWidget(&order, 7, 3);
  grid->addWidget(&picture, 8, 0);
  grid->addWidget(&guide, 8, 1, 1, 2);
  grid->addWidget(&next, 8, 3, Qt::AlignBottom);
  // Keeps the fields in place when a walk-through shows its picture next to them.
  grid->setColumnMinimumWidth(0, 64);
  for (const int column : {1, 2, 3}) grid->setColumnStretch(column, 1);
  auto* const content = new QWidget;
  content->setLayout(grid);
  setCentralWidget(content);

  country.addItems({"Austria", "Denmark", "France", "Germany", "Poland"});
  parcels.setRange(1, 20);
  guide.setWordWrap(true);
  guide.setMinimumHeight(70);
  picture.setFixedSize(64, 64);
  picture.setProperty("qzImageView", true);
  for (QWidget* const widget : {static_cast<QWidget*>(&guide), static_cast<QWidget*>(&picture),
                                static_cast<QWidget*>(&next)}) {
    widget->hide();
  }

  tag(name, 1);
  tag(city, 3);
  tag(express, 5);
  tag(insured, 6);
  tag(order, 8);
  tag(clear, 9);
  tag(guide, 10);
  tag(picture, 11);
  tag(next, 20);
  connect(&parcels, &QSpinBox::valueChanged, this, &OrderForm::showPrice);
  for (QCheckBox* const box : {&express, &insured}) {
    connect(box, &QCheckBox::toggled, this, &OrderForm::showPrice);
  }
  connect(&order, &QPushButton::clicked, this, &OrderForm::placeOrder);
  connect(&clear, &QPushButton::clicked, this, &OrderForm::clearAll);
  showPrice();
  resize(480, 480);
}

void OrderForm::showPrice() {
  const int each = 6 + (express.isChecked() ? 5 : 0) + (insured.isChecked() ? 2 : 0);
  price.setText(QString("%1 €").arg(each * parcels.value()));
}

void OrderForm::placeOrder() {
  statusBar()->showMessage(QString("Ordered for %1: %2").arg(name.text(), price.text()));
}

void OrderForm::clearAll() {
  for (QLineEdit* const field : {&name, &street, &city}) field->clear();
  remarks.clear();
  parcels.setValue(1);
  express.setChecked(false);
  insured.setChecked(false);
}
