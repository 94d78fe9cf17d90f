// SPDX-License-Identifier: MIT
// Runs the engine with any script and any presses, on the memory toolkit.
//
// An input is a line of steps, one character each, followed by a script in any format. Lists that
// run each other endlessly exhaust the stack, as documented, so such scripts are skipped, as are
// those that would run very long.
#include "qz/engine.hpp"

#include <algorithm>
#include <cstdint>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include "drivers/memory/memory_driver.hpp"
#include "fuzz/require.hpp"
#include "fuzz/run_lengths.hpp"
#include "qz/property_list/reader.hpp"

namespace qz {

namespace {

using fuzz::require;
using Script = toolkit::ValueRef<toolkit::Dictionary>;

constexpr std::size_t mostSteps = 32;
constexpr double beyondAllTimers = 0x1p65;  // seconds; timers are set in 64 bits

class Walkthrough {
 public:
  explicit Walkthrough(const Script& script) : script_(script) {
    driver_.setResourcePath("/nonexistent");
    toolkit::Tag tag = 0;
    std::vector<drivers::ViewKind> kinds;
    for (const drivers::ViewKindRow& row : drivers::viewKinds) kinds.push_back(row.kind);
    kinds.push_back(drivers::ViewKind::button);  // a second one
    for (const drivers::ViewKind kind : kinds) {
      ++tag;
      views_.push_back(driver_.makeView(kind, tag, {0, 20.0 * static_cast<double>(tag), 90, 18},
                                        window_->contentView()));
    }
    engine_->getGuiAssetsFromWindow(window_);
    engine_->setPlistDictionary(script);
  }

  ~Walkthrough() {
    attempt([&] { engine_->terminateParser(); });
    require(!engine_->flashingTimer(), "the end stops the flasher");
    // Timers that were replaced, or started after the end, hold the engine until they fire.
    driver_.advance(beyondAllTimers);
    const std::weak_ptr<QZ_Plist_State_Parser> ended = engine_;
    engine_ = nullptr;
    require(ended.expired(), "nothing keeps an engine that ended");
  }
  Walkthrough(const Walkthrough&) = delete;
  Walkthrough& operator=(const Walkthrough&) = delete;

  void step(char what) {
    if (what >= '1' && what <= '9') return press(static_cast<std::size_t>(what - '1'));
    switch (what) {
      case '+':
        return attempt([&] { driver_.advance(1); });
      case '*':
        return attempt([&] { driver_.advance(20); });
      case 'r':  // no such file: the current script continues
        return attempt([&] { engine_->loadPlist("none.plist", "", nullptr, false); });
      case 's':
        return attempt([&] { engine_->loadPlist("none.plist", "1", nullptr, true); });
      case 'b':
        return attempt([&] { engine_->loadGuiAssets(under("assets"), nullptr); });
      case 'c':
        return attempt([&] { engine_->setButtonSates(under("states")); });
      case 'd':
        return attempt([&] { engine_->getGuiAssetsFromWindow(window_); });
      case 't':
        return attempt([&] { engine_->terminateParser(); });
      case 'x':
        return attempt([&] { driver_.removeFromSuperview(views_.front()); });
      default:
        return;
    }
  }

 private:
  void press(std::size_t view) {
    attempt([&] { driver_.click(views_[view]); });
  }

  /// Errors in a script or a description may raise; the host's event loop continues.
  template <class Act>
  static void attempt(Act act) {
    try {
      act();
    } catch (const toolkit::Exception& raised) {
      require(!raised.name().empty(), "an exception has a name");
    }
  }

  Script under(std::string_view key) const {
    return toolkit::asDictionary(script_->objectForKey(key));
  }

  Script script_;
  drivers::MemoryDriver driver_;
  toolkit::Ref<toolkit::Window> window_ = driver_.makeWindow({0, 0, 400, 300});
  std::vector<toolkit::Ref<toolkit::View>> views_;
  std::shared_ptr<QZ_Plist_State_Parser> engine_ =
      QZ_Plist_State_Parser::initWithWindow(driver_.toolkit(), window_);
};

}  // namespace

}  // namespace qz

using namespace qz;

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  const std::string_view input(reinterpret_cast<const char*>(data), size);
  const std::size_t end = input.find('\n');
  if (end == std::string_view::npos) return -1;
  const Script script = qz::toolkit::dictionaryFromPropertyList(input.substr(end + 1));
  if (!script || !fuzz::RunLengths(script).areSmall()) return -1;
  Walkthrough walkthrough(script);
  for (const char what : input.substr(0, std::min(end, mostSteps))) walkthrough.step(what);
  return 0;
}
