// SPDX-License-Identifier: MIT
// A host in one file: a window with a button and a text field, and a script that drives them.
//
//   embedding-example DIRECTORY     plays DIRECTORY/script.plist
#include <iostream>

#include "QZ_Plist_State_Parser.hpp"
#include "qz/toolkit/memory/memory_toolkit.hpp"

namespace {

using namespace qz::toolkit;

void show(const Ref<TextField>& text, const Ref<Button>& button) {
  std::cout << "text: " << text->stringValue()
            << " | button: " << button->attributedTitle()->string() << '\n';
}

int play(const char* resources) {
  // The memory toolkit has no screen, but a clock. Toolkit and window must outlive the engine.
  memory::MemoryToolkit toolkit;
  toolkit.files().setResourcePath(resources);
  toolkit.log().setSink([](std::string_view line) { std::cout << "log: " << line << '\n'; });

  // The host's own window. Scripts know its controls by their tags: 2 and 5.
  Application& application = toolkit.application();
  const auto window = application.makeWindow({100, 100, 400, 160}, StyleMask::titled,
                                             BackingStore::buffered, false);
  const auto button = application.makeButton({300, 20, 80, 30});
  button->setTag(2);
  window->contentView()->addSubview(button);
  const auto text = application.makeTextField({20, 80, 360, 40});
  text->setTag(5);
  window->contentView()->addSubview(text);

  const auto engine = QZ_Plist_State_Parser::initWithWindow(toolkit, window);
  engine->getGuiAssetsFromWindow(window);
  // An empty start key means the script's smallest tag. The list there ends with IDLE_LOOP, so NO
  // means that the list or the script is missing.
  if (!engine->loadPlist("script.plist", "", nullptr, false)) {
    std::cerr << resources << "/script.plist: found no list to start with\n";
    engine->terminateParser();
    return 1;
  }
  show(text, button);

  toolkit.advance(10);  // seconds without a press: the script's timer fires
  show(text, button);
  engine->buttonPushed(button);  // a click: runs the list 2, which gives the button the tag 3
  show(text, button);
  engine->buttonPushed(button);  // runs the list 3, which ends the walk-through

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
  } catch (const Exception& raised) {  // such as a value that is not a list
    std::cerr << raised.name() << ": " << raised.reason() << '\n';
    return 1;
  }
}
