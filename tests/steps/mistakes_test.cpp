// SPDX-License-Identifier: MIT
// What is said of a source with mistakes: where, what was expected, and the likeliest name.

#include <gtest/gtest.h>

#include "tests/steps/source_folder.hpp"
#include "tools/steps/compiler.hpp"

namespace qz::tools::steps {
namespace {

using Messages = std::vector<std::string>;

/// Returns what is wrong with a source, without the name of its file.
Messages mistakesIn(const SourceFolder& folder, const std::string& path) {
  try {
    openScript(path);
  } catch (const SourceRefused& refused) {
    Messages messages;
    for (const std::string& message : refused.messages()) {
      EXPECT_TRUE(message.starts_with(path + ":")) << message;
      messages.push_back(message.substr(path.size() + 1));
    }
    return messages;
  }
  (void)folder;
  return {};
}

struct MistakeCase {
  const char* rest;  // of the source, from line 3 on
  Messages messages;
};

void expectMistakes(const std::vector<MistakeCase>& cases) {
  const SourceFolder folder;
  for (const MistakeCase& each : cases) {
    folder.writeSource(each.rest);
    EXPECT_EQ(mistakesIn(folder, "tour.yaml"), each.messages) << each.rest;
  }
}

TEST(Mistakes, InStepsHavePlaces) {
  expectMistakes({
      {"steps: {a: {next: {press: end}}}", {}},
      {"steps: {a: {nxt: {press: end}}}",
       {"3:13: expected the name of a control or a word such as “show”, found “nxt”; did you mean "
        "\"next\"?"}},
      {"steps: {a: {next: {prss: end}}}",
       {"3:20: no property is called “prss”; did you mean \"press\"?"}},
      {"steps: {alpha: {next: {press: alpa}}}",
       {"3:31: expected the name of a step, “back”, “end” or “nothing”, found “alpa”; did you mean "
        "\"alpha\"?"}},
      {"steps: {a: {next: {press: end, flash: maybe}}}",
       {"3:39: expected yes or no, found “maybe”"}},
      {"steps: {a: {text: {color: red}, next: {press: end}}}",
       {"3:20: “color” is a property of buttons; the control “text” is a text field"}},
      {"steps: {a: {next: {press: end, color: pink}}}",
       {"3:39: expected red, white, blue, green, black, orange or gray, found “pink”"}},
      {"steps: {a: {next: {press: end, color: }}}",
       {"3:32: expected red, white, blue, green, black, orange or gray, found nothing"}},
      {"steps: {a: {hide: [texd], next: {press: end}}}",
       {"3:20: expected the name of a control, found “texd”; did you mean \"text\"?"}},
      {"steps: {a: {disable: frame, next: {press: end}}}",
       {"3:22: “enabled” is a property of controls that take input; the control “frame” is a box"}},
      {"steps: {a: {font: {text: Helvetica}, next: {press: end}}}",
       {"3:26: expected a font and its size in points, such as Helvetica 13, found “Helvetica”"}},
      {"steps: {a: {font: {text: Sans;color 9}, next: {press: end}}}",
       {"3:26: expected a font and its size in points, such as Helvetica 13, found “Sans;color "
        "9”"}},
      {"steps: {a: {next: {press: {instead: end}}}}",
       {"3:27: expected “instead” with the name of a step"}},
      {"steps: {a: {after x s: a, next: {press: end}}}",
       {"3:13: expected whole seconds, such as “after 5 s”, found “after x s”"}},
      {"steps: {a: {after 1 s: {other presses: give up}, next: {press: end}}}",
       {"3:24: expected “go” with where the wait leads"}},
      {"steps: {a: {next: {press: end}, next: {press: end}}}",
       {"3:33: “next” is here twice; expected one entry of this name"}},
      {"steps: {back: {next: {press: end}}}",
       {"3:9: “back” means something else to a press; expected another name for the step"}},
      {"steps: {a: {like: b, next: {press: end}}}", {"3:19: no step is called “b”"}},
      {"steps: {a: {like: a, next: {press: end}}}", {"3:19: the step “a” is like itself"}},
      {"steps: {a: {use: f, next: {press: end}}}", {"3:18: no fragment is called “f”"}},
      {"steps: {a: {use: , next: {press: end}}}",
       {"3:13: expected the name of a fragment, found nothing"}},
      {"steps: {a: {frame: Hello, next: {press: end}}}",
       {"3:20: a box shows no text; expected properties such as “shown”"}},
      {"steps: {a: {after 1 s: {go: end, presses: give up}, next: {press: end}}}",
       {"3:34: expected “go” or “other presses”, found “presses”"}},
      {"steps: {a: {? [next] : {press: end}}}",
       {"3:15: expected a name before the colon, found a list"}},
      {"fragments: {f: {use: f}}\nsteps: {a: {use: f, next: {press: end}}}",
       {"3:22: the fragment “f” uses itself"}},
  });
}

TEST(Mistakes, OfTheWholeSourceHavePlaces) {
  expectMistakes({
      {"steps: {}", {"3:8: expected at least one step"}},
      {"stps: {}",
       {"1:1: expected an entry “steps”",
        "3:1: expected one of window, assets, include, controls, back over, every step, fragments "
        "or steps, found “stps”; did you mean \"steps\"?"}},
      {"steps: {a: {next: {press: end}}, b: {}}",
       {"3:34: nothing leads to the step “b”; expected a press or a wait that does"}},
      {"steps: {a: {next: {shown: yes}}}",
       {"3:13: at the step “a” a press of “next” leads nowhere; expected “press” with a step, "
        "“back”, "
        "“end” or “nothing”"}},
      {"steps: {a: {next: {press: b, background: red}}, b: {next: {press: end}}}",
       {"3:49: the step “b” would keep what a step before it shows, because no command takes away "
        "the red of “next”; expected “background: red” here or under “every step”"}},
      {"steps: {a: {background: sea, next: {press: b}}, b: {next: {press: end}}}",
       {"3:49: the step “b” would keep what a step before it shows, because no command takes away "
        "the background; expected “background” here or under “every step”"}},
      {"steps: {a: {picture: sea, next: {press: b}}, b: {next: {press: c}}, c: {picture: {shown: "
       "yes}, next: {press: end}}}",
       {"3:69: the step “c” would keep what a step before it shows, because no command takes away "
        "the picture of “picture”; expected “picture” or “hide”"}},
  });
}

TEST(Mistakes, OfYamlHavePlaces) {
  const SourceFolder folder;
  const auto first = [&](const std::string& text) {
    folder.write("bad.yaml", text);
    const Messages messages = mistakesIn(folder, "bad.yaml");
    return messages.empty() ? "none" : messages.front();
  };
  EXPECT_TRUE(first("steps: [a").starts_with("1:")) << first("steps: [a");
  EXPECT_EQ(first(""), "1:1: an empty file; expected a walk-through in steps");
  EXPECT_EQ(first("[]"), "1:1: expected a walk-through in steps (a table), found a list");
  EXPECT_EQ(first("a: *b"), "1:4: nothing before this has the anchor “b”");
  EXPECT_TRUE(first("--- a\n--- b\n").starts_with("2:"));
  EXPECT_EQ(first("a: b\n%\x80"), "2:1: expected no directive at the beginning of a line");
  std::string deep;
  for (int i = 0; i < 100000; ++i) deep += "- ";
  for (const std::string& text : {deep, std::string(100000, '['), std::string(100000, '{')}) {
    EXPECT_NE(first(text).find("nested too deeply"), std::string::npos) << first(text);
  }
}

TEST(Mistakes, AliasesThatExplodeAreRefusedAtOnce) {
  const SourceFolder folder;
  std::string text = "a0: &a0 [x, x, x, x, x, x, x, x, x, x]\n";
  for (int i = 1; i < 30; ++i) {
    const std::string before = "*a" + std::to_string(i - 1);
    text += "a" + std::to_string(i) + ": &a" + std::to_string(i) + " [";
    for (int k = 0; k < 10; ++k) text += before + (k < 9 ? ", " : "]\n");
  }
  folder.write("bomb.yaml", text);
  const Messages messages = mistakesIn(folder, "bomb.yaml");
  ASSERT_EQ(messages.size(), 1U);
  EXPECT_NE(messages[0].find("the aliases of this file repeat too much"), std::string::npos);
}

TEST(Mistakes, AllAreSaidAtOnce) {
  const SourceFolder folder;
  folder.writeSource("steps:\n  a: {nxt: 1}\n  b: {bck: 1}\n");
  EXPECT_EQ(mistakesIn(folder, "tour.yaml").size(), 2U);
}

TEST(Mistakes, InTheNamesOfControlsHavePlaces) {
  const SourceFolder folder;
  const auto with = [&](const std::string& controls) {
    folder.write("tour.yaml", "window: host.plist\ncontrols: {" + controls +
                                  "}\nsteps: {a: {next: {press: end}}}\n");
    return mistakesIn(folder, "tour.yaml");
  };
  EXPECT_EQ(with("next: 4"), Messages{});
  EXPECT_EQ(with("next: 4, go: 4"),
            Messages{"2:21: the control with the tag 4 is called “next” already"});
  EXPECT_EQ(with("next: 4, text: {tag: 1, nr: 1}"),
            Messages{"2:36: expected “tag” or “number”, found “nr”"});
}

/// Returns what is wrong with a source that was read, without the name of its file.
Messages messagesOf(Mistakes& mistakes, const Source& source) {
  try {
    mistakes.throwIfAny(source.files);
  } catch (const SourceRefused& refused) {
    Messages messages;
    for (const std::string& message : refused.messages()) {
      messages.push_back(message.substr(message.find(':') + 1));
    }
    return messages;
  }
  return {};
}

TEST(Mistakes, AMixedStateIsSaidAtEveryStepOrAtNone) {
  const auto with = [&](const std::string& box) {
    const auto controls = [](const auto&) {
      Control mixed{.name = {}, .tag = 3, .kind = drivers::ViewKind::toggle};
      mixed.isMixed = true;
      return std::vector<Control>{mixed, {.name = {}, .tag = 4, .kind = drivers::ViewKind::button}};
    };
    const Source source = readSourceText(
        "tour.yaml",
        "window: form.ui\ncontrols: {box: 3, next: 4}\nsteps:\n  a: {next: {press: b}}\n  b: {" +
            box + "next: {press: end}}\n",
        {.readControls = controls, .readText = {}});
    Mistakes mistakes;
    build(source.tour, {0}, mistakes);
    return messagesOf(mistakes, source);
  };
  EXPECT_EQ(with(""), Messages{});
  EXPECT_EQ(with("box: {state: on}, "),
            Messages{"4:3: at the step “a” the state of “box” is mixed, as in the host's window, "
                     "which no command sets; expected “state” here or under “every step”"});
}

TEST(Mistakes, TooManyWaysAreRefused) {
  const SourceFolder folder;
  std::string steps = "steps:\n";
  constexpr int mostSteps = 40;
  for (int i = 0; i < mostSteps; ++i) {
    const auto name = [](int number) { return "s" + std::to_string(number); };
    steps += "  " + name(i) + ": {next: {press: " + name((i + 1) % mostSteps) +
             "}, box: {press: " + name((i + 2) % mostSteps) + "}, back: {press: back}}\n";
  }
  folder.writeSource(steps);
  const Source source = readSource("tour.yaml");
  Mistakes mistakes;
  build(source.tour, {0}, mistakes, 100);
  EXPECT_EQ(messagesOf(mistakes, source),
            Messages{"11:3: more than 100 ways lead to the steps up to “s7”; expected “back over” "
                     "with a small number of steps"});
}

}  // namespace
}  // namespace qz::tools::steps
