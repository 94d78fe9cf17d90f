// SPDX-License-Identifier: MIT
// Lays out the window by hand, as Designer would.
#include "order_form.hpp"

#include <QFormLayout>
#include <QGroupBox>
#include <QHeaderView>
#include <QStatusBar>
#include <QToolBar>

OrderForm::OrderForm() {
  setWindowTitle(tr("Parcels"));
  addToolBarWithOrder();
  addFormPage();
  addOrdersPage();
  setCentralWidget(&tabs);
  react();
  giveTags();
  showPrice();
  resize(480, 440);
}

void OrderForm::addToolBarWithOrder() {
  QToolBar* const bar = addToolBar(tr("Orders"));
  bar->setToolButtonStyle(Qt::ToolButtonTextBesideIcon);
  order = bar->addAction(QIcon(":/tour/parcel.png"), tr("&Order"));
  order->setShortcut(Qt::CTRL | Qt::Key_Return);
}

void OrderForm::addFormPage() {
  auto* const to = new QGroupBox(tr("To"));
  auto* const toRows = new QFormLayout(to);
  toRows->addRow(tr("&Name"), &name);
  toRows->addRow(tr("Ci&ty"), &city);

  auto* const what = new QGroupBox(tr("Parcels"));
  auto* const whatRows = new QFormLayout(what);
  parcels.setRange(1, 20);
  whatRows->addRow(tr("N&umber"), &parcels);
  whatRows->addRow(&express);
  whatRows->addRow(&insured);
  whatRows->addRow(tr("Price"), &price);

  auto* const page = new QWidget;
  auto* const column = new QVBoxLayout(page);
  column->addWidget(to);
  column->addWidget(what);
  column->addWidget(&clear, 0, Qt::AlignTrailing);
  column->addStretch();
  tabs.addTab(page, tr("New &order"));
}

void OrderForm::addOrdersPage() {
  orders.setHorizontalHeaderLabels({tr("To"), tr("Parcels"), tr("Price")});
  orders.horizontalHeader()->setSectionResizeMode(0, QHeaderView::Stretch);
  orders.setSelectionBehavior(QTableWidget::SelectRows);
  orders.setEditTriggers(QTableWidget::NoEditTriggers);
  orders.setMaximumHeight(150);
  orders.setAccessibleName(tr("Your orders"));

  auto* const page = new QWidget;
  auto* const column = new QVBoxLayout(page);
  column->addWidget(&orders);
  column->addWidget(&cancel, 0, Qt::AlignTrailing);
  column->addStretch();
  tabs.addTab(page, tr("&Your orders"));
}

void OrderForm::react() {
  connect(&parcels, &QSpinBox::valueChanged, this, [this] { showPrice(); });
  connect(&express, &QCheckBox::toggled, this, [this] { showPrice(); });
  connect(&insured, &QCheckBox::toggled, this, [this] { showPrice(); });
  connect(&clear, &QPushButton::clicked, this, [this] { clearAll(); });
  connect(&cancel, &QPushButton::clicked, this, [this] { orders.removeRow(orders.currentRow()); });
  connect(order, &QAction::triggered, this, [this] { placeOrder(); });
}

void OrderForm::giveTags() {
  const std::pair<QObject*, int> tags[] = {{&name, 1},   {&express, 5}, {&insured, 6},
                                           {&orders, 7}, {order, 8},    {&clear, 9}};
  for (const auto& [object, tag] : tags) object->setProperty("qzTag", tag);
  order->setProperty("qzPress", "both");  // a walk-through can ask the user to order
}

void OrderForm::showPrice() {
  const int each = 6 + (express.isChecked() ? 5 : 0) + (insured.isChecked() ? 2 : 0);
  price.setText(tr("%1 €").arg(each * parcels.value()));
}

void OrderForm::placeOrder() {
  const int row = orders.rowCount();
  orders.insertRow(row);
  const QString cells[] = {name.text(), QString::number(parcels.value()), price.text()};
  for (int column = 0; column < 3; ++column) {
    orders.setItem(row, column, new QTableWidgetItem(cells[column]));
  }
  statusBar()->showMessage(tr("Ordered for %1: %2").arg(name.text(), price.text()));
}

void OrderForm::clearAll() {
  for (QLineEdit* const field : {&name, &city}) field->clear();
  parcels.setValue(1);
  express.setChecked(false);
  insured.setChecked(false);
}
