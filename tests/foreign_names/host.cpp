// SPDX-License-Identifier: MIT
// Plays a script in a program that has own things under the project's names.
#include "all_headers.hpp"
#include "engine/state.hpp"
#include "toolkit/view.hpp"
#include "tools/failure.hpp"

class QZ_Plist_State_Parser {
 public:
  int presses() const { return 2; }
};

int QZ_PLIST_STATE_PARSER_FLASH_ID = 3;

namespace hosts {
int count = 4;
}

int main(int, char** argv) {
  qz::toolkit::memory::MemoryToolkit kit;
  kit.files().setResourcePath(argv[1]);
  kit.log().setSink([](std::string_view) {});
  auto& application = kit.application();
  const auto window = application.makeWindow({0, 0, 100, 100}, qz::toolkit::StyleMask::titled,
                                             qz::toolkit::BackingStore::buffered, false);
  const auto button = application.makeButton({0, 0, 10, 10});
  button->setTag(2);
  window->contentView()->addSubview(button);
  const auto engine = qz::QZ_Plist_State_Parser::initWithWindow(kit, window);
  engine->getGuiAssetsFromWindow(window);
  const bool played = engine->loadPlist("script.plist", "", nullptr, false);
  const bool changed = button->attributedTitle()->string() == "Next";
  engine->terminateParser();
  const int own = toolkit::View{}.number() + engine::State{}.number() + tools::Failure{}.number() +
                  QZ_Plist_State_Parser{}.presses() + QZ_PLIST_STATE_PARSER_FLASH_ID + hosts::count;
  return played && changed && own == 10 + 20 + 30 + 2 + 3 + 4 ? 0 : 1;
}
