// SPDX-License-Identifier: MIT
// A host in one file: a window with a button and a text field, and a script that drives them.
//
//   embedding-example DIRECTORY     plays DIRECTORY/script.plist
#include <iostream>

#include "QZ_Plist_State_Parser.hpp"
#include "toolkit/memory/memory_driver.hpp"

namespace {

using toolkit::ViewKind;

void show(toolkit::TestDriver& screen, const toolkit::Ref<toolkit::View>& text,
          const toolkit::Ref<toolkit::View>& button) {
  std::cout << "text: " << screen.look(text).text.string()
            << " | button: " << screen.look(button).title.string() << '\n';
}

int play(const char* resources) {
  // The memory toolkit has no screen. Its driver plays the user and the clock, and shows the
  // window. Toolkit and window must outlive the engine.
  toolkit::memory::MemoryDriver screen;
  screen.setResourcePath(resources);
  screen.setLogSink([](std::string_view line) { std::cout << "log: " << line << '\n'; });

  // The host's own window. Scripts know its controls by their tags: 2 and 5.
  const auto window = screen.makeWindow({100, 100, 400, 160});
  const auto content = window->contentView();
  const auto button = screen.makeView(ViewKind::button, 2, {300, 20, 80, 30}, content);
  const auto text = screen.makeView(ViewKind::textField, 5, {20, 80, 360, 40}, content);

  const auto engine = QZ_Plist_State_Parser::initWithWindow(screen.toolkit(), window);
  engine->getGuiAssetsFromWindow(window);
  // An empty start key means the script's smallest tag. The list there ends with IDLE_LOOP, so NO
  // means that the list or the script is missing.
  if (!engine->loadPlist("script.plist", "", nullptr, false)) {
    std::cerr << resources << "/script.plist: found no list to start with\n";
    engine->terminateParser();
    return 1;
  }
  show(screen, text, button);

  screen.advance(10);  // seconds without a press: the script's timer fires
  show(screen, text, button);
  screen.click(button);  // runs the list 2, which gives the button the tag 3
  show(screen, text, button);
  screen.click(button);  // runs the list 3, which ends the walk-through

  // The host is not told that the script has ended the walk-through: ask after every press.
  if (!engine->terminating()) engine->terminateParser();
  const auto states = engine->buttonStates();  // held: its entries live only as long
  for (const auto& [tag, on] : states->entries()) {
    std::cout << "pressed: " << tag->description() << (on->boolValue() ? " (on)\n" : " (off)\n");
  }
  std::cout << "last list: " << engine->currentCommandState() << '\n';
  return 0;
}

}  // namespace

int main(int argc, char** argv) {
  if (argc != 2) {
    std::cerr << "usage: embedding-example DIRECTORY\n";
    return 2;
  }
  try {
    return play(argv[1]);
  } catch (const toolkit::Exception& raised) {  // such as a value that is not a list
    std::cerr << raised.name() << ": " << raised.reason() << '\n';
    return 1;
  }
}
