// SPDX-License-Identifier: MIT
// The catalogue of commands: every place that a command needs agrees with its row, and what a row
// says is what the command does.

#include <gtest/gtest.h>

#include <algorithm>
#include <fstream>
#include <iterator>
#include <regex>
#include <sstream>
#include <string>
#include <vector>

#include "drivers/memory/memory_driver.hpp"
#include "qz/commands.hpp"
#include "qz/engine.hpp"

namespace qz {

namespace {

using toolkit::Array;
using toolkit::Number;
using Type = ParameterType;
using Target = TargetKind;

constexpr toolkit::Tag ownTag = 3;
constexpr toolkit::Tag targetTag = 7;

std::string contents(const std::string& path) {
  std::stringstream text;
  text << std::ifstream(QZ_SOURCE_DIR "/" + path).rdbuf();
  return text.str();
}

using Words = std::vector<std::string>;

/// Returns the first group of every match, sorted.
Words matches(const std::string& text, const std::string& pattern) {
  const std::regex regex(pattern);
  Words found;
  for (std::sregex_iterator match(text.begin(), text.end(), regex), end; match != end; ++match) {
    found.push_back((*match)[1]);
  }
  std::sort(found.begin(), found.end());
  return found;
}

Words constantsWithRows() {
  Words constants;
  for (const Command& command : commandCatalogue()) constants.emplace_back(command.constant);
  std::sort(constants.begin(), constants.end());
  return constants;
}

/// Returns the words that are not equally often in both.
Words inOneOf(const Words& some, const Words& others) {
  Words different;
  std::set_symmetric_difference(some.begin(), some.end(), others.begin(), others.end(),
                                std::back_inserter(different));
  return different;
}

std::string wordFor(CommandForm form) {
  switch (form) {
    case CommandForm::none:
      return "none";
    case CommandForm::simple:
      return "simple";
    case CommandForm::compound:
      return "compound";
    case CommandForm::both:
      return "both";
  }
  return "";
}

/// Returns the command's row of the table in the page on the script language.
std::string documentedRow(const Command& command) {
  std::string parameters;
  for (const CommandParameter& parameter : command.parameters) {
    const std::string name(parameter.name);
    parameters +=
        (parameters.empty() ? "" : ", ") + (parameter.isOptional ? '[' + name + ']' : name);
  }
  std::string anchor = command.name;
  for (char& c : anchor) c = static_cast<char>(std::tolower(static_cast<unsigned char>(c)));
  return "| [`" + command.name + "`](#" + anchor + ") | " + wordFor(command.form) + " | " +
         parameters + (parameters.empty() ? "" : " ") + "| " + std::string(command.summary) + " |";
}

TEST(CommandCatalogue, HasOneRowForEachConstantOfTheHeader) {
  const std::string constant = R"(\s*(QZ_PLIST_STATE_PARSER_\w+);)";
  const auto declared =
      matches(contents("include/qz/engine.hpp"), "extern QZ_API std::string" + constant);
  EXPECT_EQ(inOneOf(declared, constantsWithRows()), Words())
      << "each constant of include/qz/engine.hpp needs one row in engine/catalogue.cpp";
}

TEST(CommandCatalogue, ObjectiveCHostsCanAssignEveryNameThatTheirHeaderDeclares) {
  const auto declared = matches(contents("include/QZ_Plist_State_Parser.h"),
                                R"(extern NSString\* QZ_NULLABLE\s+QZ_PLIST_STATE_PARSER_(\w+);)");
  const auto read = matches(contents("hosts/appkit/command_names.mm"), R"(\n  DO\((\w+), )");
  EXPECT_FALSE(declared.empty());
  EXPECT_EQ(inOneOf(declared, read), Words());
}

TEST(CommandCatalogue, EachNameIsThatOfItsConstantButForTheIdleCommand) {
  for (const Command& command : commandCatalogue()) {
    const bool isIdle = &command.name == &QZ_PLIST_STATE_PARSER_RETURN_TO_IDLE_LOOP;
    EXPECT_EQ("QZ_PLIST_STATE_PARSER_" + (isIdle ? "RETURN_TO_" + command.name : command.name),
              command.constant);
  }
}

TEST(CommandCatalogue, IsTheTableInThePageOnTheScriptLanguage) {
  const std::string page = contents("docs/script-language.md");
  for (const Command& command : commandCatalogue()) {
    const std::string row = documentedRow(command);
    EXPECT_NE(page.find('\n' + row + '\n'), std::string::npos)
        << "docs/script-language.md, \"All commands\": expected the row\n"
        << row;
  }
  EXPECT_EQ(matches(page, R"(\n\| \[`(\w+)`\])").size(), commandCatalogue().size())
      << "docs/script-language.md has rows of commands that are not in engine/catalogue.cpp";
}

TEST(CommandCatalogue, NamesAreFoundAsTheEngineComparesThem) {
  const Command* const hide = commandOfConstant("QZ_PLIST_STATE_PARSER_HIDE_OBJECT_WITH_ID");
  ASSERT_TRUE(hide);
  EXPECT_EQ(compoundCommandNamed("hide_Object_with_id"), hide);
  EXPECT_EQ(simpleCommandNamed("HIDE_OBJECT_WITH_ID"), hide);
  EXPECT_FALSE(simpleCommandNamed("hide_object_with_id"));
  EXPECT_FALSE(compoundCommandNamed("IDLE_LOOP"));
  EXPECT_TRUE(simpleCommandNamed("IDLE_LOOP"));
  EXPECT_FALSE(simpleCommandNamed("FLASH_ID"));
  EXPECT_FALSE(compoundCommandNamed("HIGHLIGHT_ID"));
  EXPECT_FALSE(simpleCommandNamed("HIGHLIGHT_ID"));
  EXPECT_FALSE(commandOfConstant("HIDE_OBJECT_WITH_ID"));
}

TEST(CommandCatalogue, TheFirstOfTwoCommandsWithTheSameNameIsFound) {
  const Command* const hide = compoundCommandNamed("HIDE_OBJECT_WITH_ID");
  const Command* const show = compoundCommandNamed("SHOW_OBJECT_WITH_ID");
  show->name = "HIDE_OBJECT_WITH_ID";
  EXPECT_EQ(compoundCommandNamed("HIDE_OBJECT_WITH_ID"), hide);
  EXPECT_FALSE(compoundCommandNamed("SHOW_OBJECT_WITH_ID"));
  show->name = "SHOW_OBJECT_WITH_ID";
}

// --- what a row says is what the command does ---

QZ_Plist_State_Parser::Value sample(Type type) {
  switch (type) {
    case Type::controlTag:
    case Type::controlOrListTag:
      return Number::withLong(targetTag);
    case Type::listTag:
    case Type::newTag:
    case Type::seconds:
    case Type::points:
    case Type::integer:
    case Type::anything:
      return Number::withLong(40);
    case Type::flag:
      return Number::withBool(false);  // NO: marking a control that is not a button then raises
    case Type::fontName:
      return toolkit::String::make("Helvetica");
    case Type::colorName:
      return toolkit::String::make("blue");
    case Type::text:
    case Type::html:
    case Type::imageName:
      return toolkit::String::make("sample");
  }
  return nullptr;
}

/// Returns a value that cannot be read as the type; absent if every value can.
QZ_Plist_State_Parser::Value unreadable(Type type) {
  switch (type) {
    case Type::text:
    case Type::imageName:
    case Type::colorName:
      return Number::withLong(1);
    case Type::html:
    case Type::fontName:  // counts as an unknown font
    case Type::anything:
      return nullptr;
    default:
      return Array::make();
  }
}

drivers::ViewKind viewOf(Target target) {
  switch (target) {
    case Target::button:
      return drivers::ViewKind::button;
    case Target::buttonWithState:
      return drivers::ViewKind::toggle;
    case Target::imageView:
      return drivers::ViewKind::imageView;
    case Target::anyControl:
    case Target::textField:
      return drivers::ViewKind::textField;
    case Target::none:
    case Target::anyView:
      break;
  }
  return drivers::ViewKind::box;
}

struct Seeker final : Observer {
  void controlSought(toolkit::Tag tag, const toolkit::Ref<toolkit::View>&) override {
    tags.push_back(tag);
  }
  std::vector<toolkit::Tag> tags;
};

/// Runs one command in a window with a view of one kind for each of the two tags.
struct Trial {
  Trial(const Command& command, drivers::ViewKind kind) : name(command.name) {
    for (const CommandParameter& parameter : command.parameters) {
      parameters.push_back(sample(parameter.type));
    }
    driver.setResourcePath(QZ_SOURCE_DIR);
    for (const toolkit::Tag tag : {ownTag, targetTag}) {
      const auto view = driver.makeView(kind, tag, {0, 0, 50, 20}, window->contentView());
      driver.setCaption(view, "caption");
    }
    engine->getGuiAssetsFromWindow(window);
  }
  ~Trial() { engine->terminateParser(); }
  Trial(const Trial&) = delete;
  Trial& operator=(const Trial&) = delete;

  /// NO if the command gave NO or raised.
  bool run() {
    seeker->tags.clear();
    engine->setObserver(seeker);
    raised = false;
    try {
      return engine->doCompoundCommand(name, Array::make(parameters), Number::withLong(ownTag));
    } catch (const toolkit::Exception&) {
      raised = true;
      return false;
    }
  }

  std::string name;
  std::vector<QZ_Plist_State_Parser::Value> parameters;
  bool raised = false;
  std::shared_ptr<Seeker> seeker = std::make_shared<Seeker>();
  drivers::MemoryDriver driver;
  toolkit::Ref<toolkit::Window> window = driver.makeWindow({0, 0, 300, 200});
  std::shared_ptr<QZ_Plist_State_Parser> engine =
      QZ_Plist_State_Parser::initWithWindow(driver.toolkit(), nullptr);
};

std::vector<Command> compoundCommands() {
  std::vector<Command> compound;
  for (const Command& command : commandCatalogue()) {
    const bool isCompound =
        command.form == CommandForm::compound || command.form == CommandForm::both;
    if (isCompound) compound.push_back(command);
  }
  return compound;
}

/// Whether the command gives NO although it has done its work.
bool alwaysGivesNo(const Command& command) {
  return command.flow == CommandFlow::runsList || command.positionOf(Type::controlOrListTag);
}

TEST(CommandCatalogue, CommandsTakeTheParametersOfTheirRows) {
  for (const Command& command : compoundCommands()) {
    Trial all(command, viewOf(command.target));
    EXPECT_TRUE(all.run() || alwaysGivesNo(command)) << command.name;
    EXPECT_FALSE(all.raised) << command.name;
    const auto isRequired = [](const CommandParameter& parameter) { return !parameter.isOptional; };
    const auto required =
        std::count_if(command.parameters.begin(), command.parameters.end(), isRequired);
    Trial fewer(command, viewOf(command.target));
    fewer.parameters.resize(static_cast<std::size_t>(required));
    EXPECT_TRUE(fewer.run() || alwaysGivesNo(command)) << command.name;
    EXPECT_FALSE(fewer.raised) << command.name;
    if (required == 0) continue;
    fewer.parameters.pop_back();
    EXPECT_FALSE(fewer.run()) << command.name;
    const bool isPrevented = command.extraParameters == ExtraParameters::preventTheCommand;
    EXPECT_TRUE(fewer.raised || isPrevented || fewer.parameters.empty()) << command.name;
  }
}

TEST(CommandCatalogue, CommandsReadParametersAsTheTypesOfTheirRows) {
  for (const Command& command : compoundCommands()) {
    for (std::size_t i = 0; i < command.parameters.size(); ++i) {
      Trial trial(command, viewOf(command.target));
      const auto value = unreadable(command.parameters[i].type);
      trial.parameters[i] = value ? value : Number::withLong(1);
      trial.run();
      EXPECT_EQ(trial.raised, static_cast<bool>(value))
          << command.name << ": " << command.parameters[i].name;
    }
  }
}

TEST(CommandCatalogue, CommandsLookForTheTargetsOfTheirRows) {
  using Tags = std::vector<toolkit::Tag>;
  for (const Command& command : compoundCommands()) {
    Trial trial(command, viewOf(command.target));
    trial.run();
    auto& sought = trial.seeker->tags;
    sought.erase(std::unique(sought.begin(), sought.end()), sought.end());
    const bool seeks = command.target != Target::none || command.positionOf(Type::controlOrListTag);
    EXPECT_EQ(sought, seeks ? Tags{targetTag} : Tags{}) << command.name;
    EXPECT_EQ(command.target != Target::none, command.positionOf(Type::controlTag).has_value());
    EXPECT_TRUE(command.flow != CommandFlow::runsList || command.positionOf(Type::listTag));
  }
}

TEST(CommandCatalogue, CommandsDoNotWorkOnABoxUnlessTheyWorkOnAnyView) {
  for (const Command& command : compoundCommands()) {
    if (command.target == Target::none) continue;
    Trial trial(command, drivers::ViewKind::box);
    EXPECT_EQ(trial.run(), command.target == Target::anyView) << command.name;
  }
}

TEST(CommandCatalogue, ExtraParametersDoWhatTheRowsSay) {
  for (const Command& command : compoundCommands()) {
    Trial trial(command, viewOf(command.target));
    trial.parameters.emplace_back(Number::withLong(1));
    const bool result = trial.run();
    EXPECT_FALSE(trial.raised) << command.name;
    const auto extra = command.extraParameters;
    const bool isPrevented = extra == ExtraParameters::preventTheCommand;
    EXPECT_EQ(result || alwaysGivesNo(command), !isPrevented) << command.name;
    if (command.target == Target::none || isPrevented) continue;
    const bool losesTag = extra == ExtraParameters::overrideTheTag;
    EXPECT_EQ(trial.seeker->tags.at(0), losesTag ? ownTag : targetTag) << command.name;
  }
}

}  // namespace

}  // namespace qz
