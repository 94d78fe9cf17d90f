// Running command lists over few and many controls on the memory toolkit, beside the toolkit calls
// themselves and beside Lua; a press, a tick of the flasher, discovery.
#include <cstdio>
#include <cstdlib>
#include <memory>
#include <string>
#include <vector>

#include "QZ_Plist_State_Parser.hpp"
#include "bench/direct_walkthrough.hpp"
#include "bench/lua_walkthrough.hpp"
#include "bench/measuring.hpp"
#include "bench/operations.hpp"
#include "toolkit/memory/memory_driver.hpp"

namespace {

using bench::Operation;
using bench::What;
using toolkit::Number;
using toolkit::String;
using List = toolkit::ValueRef<toolkit::Array>;

/// A window of buttons with the tags 1 … `controls`, adopted by an engine.
struct Stage {
  explicit Stage(long controls) {
    driver.setLogSink([](std::string_view) {});
    for (long tag = 1; tag <= controls; ++tag) {
      driver.makeView(toolkit::ViewKind::toggle, tag, {0, 0, 90, 20}, window->contentView());
    }
    engine->getGuiAssetsFromWindow(window);
  }
  ~Stage() { engine->terminateParser(); }
  Stage(const Stage&) = delete;
  Stage& operator=(const Stage&) = delete;

  toolkit::memory::MemoryDriver driver;
  toolkit::Ref<toolkit::Window> window = driver.makeWindow({0, 0, 800, 600});
  std::shared_ptr<QZ_Plist_State_Parser> engine =
      QZ_Plist_State_Parser::initWithWindow(driver.toolkit(), window);
};

/// So many commands, of every sort in turn, spread over the controls.
std::vector<Operation> operationsOver(long controls, std::size_t count) {
  constexpr What sorts[] = {What::text,   What::title,   What::toolTip,
                            What::enable, What::disable, What::stateOn};
  constexpr long step = 7919;  // a prime: every control has its turn
  std::vector<Operation> operations;
  for (std::size_t i = 0; i < count; ++i) {
    const long tag = 1 + static_cast<long>(i) * step % controls;
    operations.push_back(
        {sorts[i % std::size(sorts)], tag, "Take the cup off the tray, step " + std::to_string(i)});
  }
  return operations;
}

toolkit::ValueRef<> commandOf(const Operation& operation) {
  const auto make = [&](const char* name, bool hasText) {
    std::vector<toolkit::ValueRef<>> elements{String::make(name)};
    if (hasText) elements.emplace_back(String::make(operation.text));
    elements.emplace_back(Number::withLong(operation.tag));
    return toolkit::Array::make(std::move(elements), toolkit::Mutability::immutable);
  };
  switch (operation.what) {
    case What::text:
      return make("SET_TEXT_FOR_OBJECT_ID", true);
    case What::title:
      return make("SET_TITLE_FOR_OBJECT_ID", true);
    case What::toolTip:
      return make("SET_TOOL_TIP_FOR_ID", true);
    case What::enable:
      return make("ENABLE_OBJECT_WITH_ID", false);
    case What::disable:
      return make("DISABLE_OBJECT_WITH_ID", false);
    case What::stateOn:
      return make("SET_STATE_ON_FOR_OBJECT_ID", false);
  }
  return nullptr;
}

List listOf(const std::vector<Operation>& operations) {
  std::vector<toolkit::ValueRef<>> commands;
  for (const Operation& operation : operations) commands.push_back(commandOf(operation));
  return toolkit::Array::make(std::move(commands), toolkit::Mutability::immutable);
}

void require(bool holds, const char* what) {
  if (holds) return;
  std::fprintf(stderr, "bench-running: %s\n", what);
  std::exit(1);
}

/// The contenders run the same operations; what they leave in the window must be the same.
std::string captions(Stage& stage) {
  std::string all;
  for (const auto& view : stage.window->contentView()->subviews()) {
    const auto picture = stage.driver.look(view);
    all += picture.title.string() + "|" + picture.toolTip + (picture.enabled ? "+" : "-");
  }
  return all;
}

void measureLists() {
  constexpr std::size_t commands = 600;
  bench::printHead("A command of a list", {"controls", "this engine", "direct calls", "Lua 5.4",
                                           "this : direct", "Lua : this"});
  std::vector<std::pair<double, double>> points;
  for (const long controls : {10L, 100L, 1000L, 10000L}) {
    const auto operations = operationsOver(controls, commands);
    Stage engineStage(controls), directStage(controls), luaStage(controls);
    const List list = listOf(operations);
    bench::LuaWalkthrough lua(*luaStage.window, operations);
    const auto id = Number::withLong(1);
    const auto t =
        bench::leastTimes({{"engine", [&] { engineStage.engine->processCommandArray(list, id); }},
                           {"direct", [&] { bench::runDirectly(directStage.window, operations); }},
                           {"Lua", [&] { lua.run(); }}},
                          controls > 1000 ? 15 : 150);
    require(captions(engineStage) == captions(directStage), "direct calls came to something else");
    require(captions(engineStage) == captions(luaStage), "Lua came to something else");
    points.emplace_back(controls, t[0]);
    const auto one = [](double time) { return bench::shownTime(time / commands); };
    bench::printRow({std::to_string(controls), one(t[0]), one(t[1]), one(t[2]),
                     bench::shownRatio(t[0] / t[1]), bench::shownRatio(t[2] / t[0])});
  }
  std::printf("\nTime grows with the number of controls to the power of %.3f.\n",
              bench::fittedExponent(points));
}

void measureListLength() {
  std::vector<std::pair<double, double>> points;
  Stage stage(100);
  const auto id = Number::withLong(1);
  for (const std::size_t commands : {100U, 1000U, 10000U, 100000U}) {
    const List list = listOf(operationsOver(100, commands));
    const double time = bench::leastTimes(
        {{"engine", [&] { stage.engine->processCommandArray(list, id); }}}, 15)[0];
    points.emplace_back(commands, time);
  }
  std::printf("It grows with the list's length, from 100 to 100000, to the power of %.3f.\n",
              bench::fittedExponent(points));
}

double growth(const std::vector<double>& times, const std::vector<long>& controls) {
  std::vector<std::pair<double, double>> points;
  for (std::size_t i = 0; i < times.size(); ++i) points.emplace_back(controls[i], times[i]);
  return bench::fittedExponent(points);
}

void measureEvents() {
  const std::vector<long> sizes{10, 100, 1000, 10000};
  std::vector<double> press, tick, discovery;
  for (const long controls : sizes) {
    Stage stage(controls);
    const auto script = toolkit::Dictionary::make();
    script->setObject(listOf(operationsOver(controls, 10)), std::to_string(controls));
    stage.engine->setPlistDictionary(script);
    const auto last = stage.window->contentView()->subviews().back();
    stage.engine->setFlashing(true);
    for (long tag = 1; tag <= 10; ++tag) {
      stage.engine->QZ_Plist_State_Processor_FLASH_ID(Number::withLong(tag), true);
    }
    const auto t = bench::leastTimes(
        {{"press", [&] { stage.driver.click(last); }},
         {"tick", [&] { stage.engine->flasherFired(stage.engine->flashingTimer()); }},
         {"discovery", [&] { stage.engine->getGuiAssetsFromWindow(stage.window); }}},
        controls > 1000 ? 15 : 100);
    press.push_back(t[0]);
    tick.push_back(t[1]);
    discovery.push_back(t[2]);
  }
  bench::printHead("Other work, by the number of controls",
                   {"", "10", "100", "1000", "10000", "grows to the power of"});
  const auto row = [&](const char* name, const std::vector<double>& times) {
    std::vector<std::string> cells{name};
    for (const double time : times) cells.push_back(bench::shownTime(time));
    cells.push_back(bench::shownRatio(growth(times, sizes)).substr(std::string("×").size()));
    bench::printRow(cells);
  };
  row("a press, from the click to the end of its list of 10", press);
  row("a tick of the flasher, 10 tags flashing", tick);
  row("discovery of a window", discovery);
}

}  // namespace

int main() {
  measureLists();
  measureListLength();
  measureEvents();
  return 0;
}
