// SPDX-License-Identifier: MIT
// One living walk-through.
#include "tests/check/world.hpp"

#include <algorithm>
#include <cstdio>
#include <limits>
#include <tuple>

#include "qz/property_list/scalars.hpp"
#include "qz/toolkit/exception.hpp"

namespace qz::naive {

namespace {

std::string smallestTag(const Script& script) {
  std::optional<std::int32_t> smallest;
  for (const auto& entry : script->entries()) {
    const std::int32_t tag = entry.key->intValue();
    if (!smallest || tag < *smallest) smallest = tag;
  }
  return smallest ? std::to_string(*smallest) : "";
}

std::string lineOf(const drivers::ViewPicture& control) {
  return std::string(rowOf(control.kind).name) + ":" + std::to_string(control.tag) + ":" +
         (control.hidden ? "hidden" : "shown") + ":" + (control.enabled ? "enabled" : "disabled") +
         ";";
}

std::string lineOf(const std::vector<PendingTimer>& timers) {
  std::string line;
  for (const PendingTimer& timer : timers) {
    char seconds[64];
    std::snprintf(seconds, sizeof seconds, "%.6f", timer.timeLeft);
    line += (line.empty() ? "" : ",") + timer.key + "@" + seconds;
  }
  return line;
}

drivers::MemoryDriver& withResources(drivers::MemoryDriver& driver, const std::string& path) {
  if (!path.empty()) driver.setResourcePath(path);
  return driver;
}

std::string colorText(const toolkit::Color& color) {
  return std::to_string(color.red) + " " + std::to_string(color.green) + " " +
         std::to_string(color.blue) + " " + std::to_string(color.alpha);
}

}  // namespace

std::string TextNumbers::numberOf(const toolkit::AttributedString& text) {
  const auto found = std::find(texts_.begin(), texts_.end(), text);
  const auto number = found - texts_.begin();
  if (found == texts_.end()) texts_.push_back(text);
  return std::to_string(number);
}

World::World(Script script, const HostWindow& host, const std::string& resources)
    : script_(std::move(script)),
      window_(makeHostWindow(withResources(driver_, resources), host, "the host's window")),
      engine_(QZ_Plist_State_Parser::initWithWindow(driver_.toolkit(), window_)) {
  engine_->getGuiAssetsFromWindow(window_);
  // The engine changes its own copy when the walk-through ends.
  engine_->setPlistDictionary(script_->copy(toolkit::Mutability::changeable));
  // Flashing changes the pressed-in look alone, and would cost two firings for every second.
  engine_->flashingTimer()->invalidate();
  tracer_ = std::make_shared<Tracer>(*engine_, script_);
  engine_->setObserver(tracer_);
  for (const auto& view : views()) ownTags_.push_back(view->tag());
}

World::~World() {
  engine_->setObserver(nullptr);
  engine_->killAllTimers();  // they would keep the engine alive
}

const Trace& World::perform(const Move& move) {
  tracer_->trace = {};
  ReadingTimes reading(driver_, window_, ownTags_, tracer_->history);
  if (move.kind == Move::Kind::wait) {
    const PendingTimer first = timers().front();
    reading.wait(first.timeLeft, history().starters.at(first.key).site);
  }
  run(move);
  reading.end(tracer_->history, tracer_->trace);
  return tracer_->trace;
}

void World::run(const Move& move) {
  try {
    switch (move.kind) {
      case Move::Kind::start:
        start(move.key);
        break;
      case Move::Kind::press:
        press(move.index);
        break;
      case Move::Kind::wait:
        driver_.advance(timers().front().timeLeft);
        break;
    }
  } catch (const toolkit::Exception&) {
    // The value under the key is no list; nothing has run.
  } catch (const Tracer::EndlessChain&) {
    // The trace says so.
  }
}

void World::start(const std::string& key) {
  const std::string from = key.empty() ? smallestTag(script_) : key;
  const auto id = toolkit::String::make(from)->intValue();
  engine_->processCommandArray(engine_->plistDictionary()->objectForKey(from),
                               toolkit::Number::withLong(id));
}

void World::press(std::size_t index) {
  const auto view = views()[index];
  const bool changes = rowOf(driver_.look(view).kind).showsState;
  if (changes) tracer_->history.userState[index] = true;
  tracer_->pressed(view->tag());
  driver_.click(view);
}

std::vector<Move> World::moves() const {
  std::vector<Move> moves;
  if (hasEnded()) return moves;
  if (isOnScreen()) {
    const auto controls = pictures();
    for (std::size_t i = 0; i < controls.size(); ++i) {
      const auto& control = controls[i];
      if (!isButton(control.kind) || control.hidden || !control.enabled) continue;
      moves.push_back({Move::Kind::press, "", control.tag, i});
    }
  }
  const auto pending = timers();
  const bool fires =
      !pending.empty() && pending.front().timeLeft < std::numeric_limits<double>::infinity();
  if (fires) moves.push_back({.kind = Move::Kind::wait});
  return moves;
}

bool World::isOnScreen() const { return driver_.look(window_).visible; }

std::string World::windowImage() const { return driver_.look(window_).layerImage.value_or(""); }

std::string World::place() const {
  std::string place;
  for (const auto& control : pictures()) place += lineOf(control);
  const auto window = driver_.look(window_);
  place += std::string("window:") + (window.visible ? "shown" : "gone") + ":" +
           (window.sheetOf ? "sheet" : "free") + ";";
  place += "timers:" + lineOf(timers()) + ";";
  place += std::string("script:") + (engine_->plistDictionary() ? "yes" : "no") + ";";
  place += std::string("ended:") + (hasEnded() ? "yes" : "no");
  return place;
}

std::vector<PendingTimer> World::timers() const {
  constexpr double never = std::numeric_limits<double>::infinity();
  std::vector<std::tuple<double, std::size_t, std::string>> order;
  const auto table = engine_->objectIdTimers();
  for (const auto& [key, timer] : table->entries()) {
    if (!timer->isValid()) continue;
    const bool fires = !lastsForEver(timer->interval());
    // Those that never fire have no order, and stay sorted by key.
    order.emplace_back(fires ? timer->timeLeft() : never, fires ? history().startOrder.at(key) : 0,
                       key);
  }
  std::sort(order.begin(), order.end());
  std::vector<PendingTimer> timers;
  timers.reserve(order.size());
  for (const auto& [left, unused, key] : order) timers.push_back({key, left});
  return timers;
}

std::vector<drivers::ViewPicture> World::pictures() const {
  std::vector<drivers::ViewPicture> pictures;
  for (const auto& view : views()) pictures.push_back(driver_.look(view));
  return pictures;
}

ControlLook World::lookOf(const drivers::ViewPicture& picture, std::size_t index,
                          TextNumbers& numbers) const {
  ControlLook look;
  if (isButton(picture.kind)) look[0] = numbers.numberOf(picture.title);
  if (picture.kind == drivers::ViewKind::textField) look[0] = numbers.numberOf(picture.text);
  look[1] = picture.image.value_or("");
  look[2] = picture.toolTip;
  if (picture.background) look[3] = colorText(*picture.background);
  if (rowOf(picture.kind).showsState) {
    look[4] =
        history().userState[index] ? userState : std::to_string(static_cast<int>(picture.state));
  }
  return look;
}

std::map<std::string, bool> World::flashMarks() const {
  std::map<std::string, bool> marks;
  const auto table = engine_->flashingTagIds();
  for (const auto& [key, flag] : table->entries()) marks[key->description()] = flag->boolValue();
  return marks;
}

}  // namespace qz::naive
