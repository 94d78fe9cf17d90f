// SPDX-License-Identifier: MIT
// The form with walk-throughs in its Help menu: over the form itself, in a sheet, in a guide.
#pragma once

#include <QMenuBar>

#include "form_guide.hpp"
#include "order_form.hpp"
#include "qz/hosts/qt/walk_through.hpp"
#include "tips_panel.hpp"

class GuidedForm final : public OrderForm {
 public:
  /// Scripts and images are looked for in the directory.
  explicit GuidedForm(std::string_view resources) {
    toolkit_.files().setResourcePath(resources);
    QMenu* const help = menuBar()->addMenu("&Help");
    help->addAction("Show me &around", [this] { walkThrough_.play("tour.plist", *this); });
    help->addAction("&Tips", [this] { walkThrough_.playInSheet("tips.plist", tips, *this); });
    help->addAction("&Guide me", [this] { formGuide_.play(walkThrough_); });
  }

  TipsPanel tips;

 private:
  qz::toolkit::qt::QtToolkit toolkit_;
  qz::hosts::qt::WalkThrough walkThrough_{toolkit_};
  FormGuide formGuide_{toolkit_, *this};
};
