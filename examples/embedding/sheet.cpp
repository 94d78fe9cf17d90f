// SPDX-License-Identifier: MIT
// A walk-through as a sheet, twice: the second begins with the buttons as the first left them.
//
//   sheet-example DIRECTORY     plays DIRECTORY/script.plist
#include <iostream>

#include "QZ_Plist_State_Parser.hpp"
#include "qz/drivers/driver.hpp"
#include "qz/drivers/memory/toolkit_row.hpp"

namespace {

using qz::drivers::ViewKind;

/// Takes the sheet off the screen: the engine only ends it.
class Sheet final : public qz::toolkit::SheetDelegate {
 public:
  void sheetDidEnd(const qz::toolkit::Ref<qz::toolkit::Window>& sheet, long returnCode,
                   void*) override {
    sheet->orderOut();
    std::cout << "the sheet ended with " << returnCode << '\n';
  }
};

/// Plays the script in a panel over the window. Gives the states of the buttons.
QZ_Plist_State_Parser::Dictionary play(qz::drivers::Driver& screen,
                                       const qz::toolkit::Ref<qz::toolkit::Window>& window,
                                       const QZ_Plist_State_Parser::Dictionary& states) {
  const auto panel = screen.makeWindow({0, 0, 400, 160});
  const auto next = screen.makeView(ViewKind::button, 2, {300, 20, 80, 30}, panel->contentView());
  const auto box = screen.makeView(ViewKind::toggle, 6, {20, 20, 200, 30}, panel->contentView());

  const auto engine = QZ_Plist_State_Parser::initWithWindow(screen.toolkit(), window);
  engine->getGuiAssetsFromWindow(panel);
  engine->setButtonSates(states);                   // the name is spelled so
  const auto delegate = std::make_shared<Sheet>();  // kept until it was told
  engine->loadPlist("script.plist", "", delegate, true);

  screen.click(box);              // from how it was left
  screen.click(next);             // runs the list 2, which gives the button the tag 3
  screen.click(next);             // runs the list 3, which ends the walk-through, and so the sheet
  return engine->buttonStates();  // a copy, which outlasts the engine
}

}  // namespace

int main(int argc, char** argv) {
  if (argc != 2) {
    std::cerr << "usage: sheet-example DIRECTORY\n";
    return 2;
  }
  const auto screen = qz::drivers::makeMemoryDriver();
  screen->setResourcePath(argv[1]);
  const auto window = screen->makeWindow({100, 100, 600, 400});

  QZ_Plist_State_Parser::Dictionary states = qz::toolkit::Dictionary::make();
  for (int round = 0; round < 2; ++round) {
    states = play(*screen, window, states);
    std::cout << "the box is " << (states->objectForKey("6")->boolValue() ? "on\n" : "off\n");
  }
  return 0;
}
