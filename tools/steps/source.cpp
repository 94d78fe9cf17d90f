// SPDX-License-Identifier: MIT
// Reads a source from its top: the window, the names of its controls, and then the steps.
#include "tools/steps/source.hpp"

#include <algorithm>
#include <filesystem>
#include <map>

#include "tools/steps/fragments.hpp"
#include "tools/steps/parts.hpp"
#include "tools/steps/step_reader.hpp"
#include "tools/steps/words.hpp"
#include "tools/support/drivers.hpp"
#include "tools/support/suggestions.hpp"
#include "tools/support/text_layout.hpp"
#include "tools/support/whole_file.hpp"
#include "tools/walkthrough/step_picture.hpp"

namespace qz::tools::steps {
namespace {

namespace fs = std::filesystem;
using drivers::Caption;

constexpr int greatestTag = 2147483647;  // the engine reads tags as an int
Control controlOf(const drivers::ViewPicture& view) {
  Control control{.tag = view.tag, .kind = view.kind};
  const Caption caption = rowOf(view.kind).caption;
  if (caption == Caption::title) control.caption = view.title.string();
  if (caption == Caption::text) control.caption = view.text.string();
  if (caption == Caption::imageName) control.caption = view.image;
  control.toolTip = view.toolTip;
  control.isShown = !view.hidden;
  control.isEnabled = view.enabled;
  control.isOn = view.state == toolkit::State::on;
  control.isMixed = view.state == toolkit::State::mixed;
  return control;
}

/// Returns the text of an included file. A device, for example, has no end.
std::optional<std::string> includedText(const std::string& path) {
  std::error_code error;
  return fs::is_regular_file(path, error) ? wholeFile(path) : std::nullopt;
}

/// Reads the parts of a source in the order in which they need each other, which is not always that
/// of the file.
class SourceReader {
 public:
  SourceReader(Source& source, const SourceInputs& inputs, const Translate& translate)
      : source_(source),
        tour_(source.tour),
        inputs_(inputs),
        texts_(translate),
        parts_(source.files, inputs.readText, mistakes_) {}

  void read(std::string text) {
    parts_.read(source_.path, std::move(text));
    if (!parts_.areWhole()) mistakes_.throwIfAny(source_.files);
    require("steps");
    require("controls");
    if (!part("window") && !part("assets")) {
      mistakes_.add(0, "expected “window”, the file of the host's window, or “assets”");
    }
    if (part("window") && part("assets")) {
      mistakes_.add(part("assets")->place, "expected either “window” or “assets”, found both");
    }
    mistakes_.throwIfAny(source_.files);
    readWindow();
    readControls();
    readSteps();
    source_.texts = texts_.list();
    mistakes_.throwIfAny(source_.files);
  }

 private:
  NodeRef part(const std::string& word) const { return parts_.part(word); }

  void require(const std::string& word) {
    if (!part(word)) mistakes_.add(0, "expected an entry " + quote(word));
  }

  /// Returns the path of a file that an entry names, from the directory in which the entry is.
  std::optional<std::string> fileIn(const std::string& word) {
    const NodeRef node = part(word);
    if (!node) return std::nullopt;
    const auto name = textOf(*node, "the name of a file", mistakes_);
    if (!name) return std::nullopt;
    const fs::path from = source_.files.at(node->place).path;
    return (from.parent_path() / *name).string();
  }

  void readWindow() {
    source_.stage.window = fileIn("window");
    source_.stage.assets = fileIn("assets");
    mistakes_.throwIfAny(source_.files);
    tour_.controls = inputs_.readControls(source_.stage);
  }

  void readControls() {
    for (const auto& [name, value] : entriesOf(*part("controls"), "names with tags", mistakes_)) {
      if (const auto which = readControl(*value)) nameControl(*which, *name, value->place);
    }
  }

  /// A tag, and how many controls behind have the same.
  struct WhichControl {
    int tag = 0;
    int number = 1;  ///< from 1: the back-most, as commands find it
  };

  void nameControl(const WhichControl& which, const Node& name, Place place) {
    Control* const found = findControl(which);
    if (!found) {
      mistakes_.add(place, "the window has no " + wordsFor(which));
    } else if (!found->name.empty()) {
      mistakes_.add(name.place,
                    "the " + wordsFor(which) + " is called " + quote(found->name) + " already");
    } else {
      found->name = name.text;
    }
  }

  std::optional<WhichControl> readControl(const Node& value) {
    constexpr int mostControls = 10000;
    WhichControl which;
    const Node* tagNode = value.kind == Node::Kind::table ? nullptr : &value;
    if (!tagNode) {
      for (const auto& [word, each] : entriesOf(value, "a table", mistakes_)) {
        if (word->text == "tag") {
          tagNode = each.get();
        } else if (word->text == "number") {
          which.number =
              numberOf(*each, 1, mostControls,
                       "which of the controls with the tag, from 1 at the back", mistakes_)
                  .value_or(1);
        } else {
          mistakes_.add(word->place, "expected “tag” or “number”, found " + foundWords(*word));
        }
      }
    }
    if (!tagNode) {
      mistakes_.add(value.place, "expected “tag” with the tag of a control");
      return std::nullopt;
    }
    const auto tag =
        numberOf(*tagNode, -greatestTag, greatestTag, "the tag of a control", mistakes_);
    if (!tag) return std::nullopt;
    which.tag = *tag;
    return which;
  }

  Control* findControl(WhichControl which) {
    for (Control& control : tour_.controls) {
      if (control.tag == which.tag && --which.number == 0) return &control;
    }
    return nullptr;
  }

  static std::string wordsFor(const WhichControl& which) {
    const std::string with = "control with the tag " + std::to_string(which.tag);
    return which.number == 1 ? with : with + " and the number " + std::to_string(which.number);
  }

  void readSteps() {
    Fragments fragments(mistakes_);
    if (const NodeRef table = part("fragments")) fragments.read(table);
    const auto entries = entriesOf(*part("steps"), "the steps, by name", mistakes_);
    std::map<std::string, StepIndex> names;
    std::map<std::string, NodeRef> bodies;
    for (const auto& [name, body] : entries) {
      if (name->text == words::back || name->text == words::end || name->text == words::nothing) {
        mistakes_.add(name->place, quote(name->text) +
                                       " means something else to a press; expected "
                                       "another name for the step");
      }
      names.emplace(name->text, names.size());
      bodies[name->text] = fragments.expand(body);
    }
    if (entries.empty()) mistakes_.add(part("steps")->place, "expected at least one step");
    const StepReader reader(tour_.controls, names, texts_, mistakes_);
    tour_.everyStep.controls.resize(tour_.controls.size());
    if (const NodeRef every = part("every step")) {
      const NodeRef body = fragments.expand(every);
      texts_.enterStep("every step");
      reader.read(*tableOf(body), tour_.everyStep);
    }
    for (const auto& [name, body] : entries) {
      Step step{.name = name->text, .place = name->place};
      texts_.enterStep(name->text);
      readLike(name->text, *name, bodies, reader, step.words, 0);
      tour_.steps.push_back(std::move(step));
    }
    if (const NodeRef depth = part("back over")) {
      tour_.mostStepsBack = static_cast<std::size_t>(
          numberOf(*depth, 0, 1000, "how many steps Back can go", mistakes_).value_or(0));
    }
  }

  /// Returns a table that can be read: a step may also be empty.
  NodeRef tableOf(const NodeRef& body) {
    if (body->kind == Node::Kind::table) return body;
    if (body->kind != Node::Kind::nothing) {
      mistakes_.add(body->place,
                    "expected what the step shows (a table), found " + foundWords(*body));
    }
    return std::make_shared<Node>(Node{.kind = Node::Kind::table, .place = body->place});
  }

  /// Reads a step, after the step that it is like.
  void readLike(const std::string& name, const Node& at,
                const std::map<std::string, NodeRef>& bodies, const StepReader& reader,
                StepWords& words, std::size_t depth) {
    const auto found = bodies.find(name);
    if (found == bodies.end()) {
      std::vector<std::string_view> names;
      names.reserve(bodies.size());
      for (const auto& [known, body] : bodies) names.push_back(known);
      mistakes_.add(at.place, "no step is called " + foundWords(at) + didYouMean(name, names));
      return;
    }
    if (depth > bodies.size()) {
      mistakes_.add(at.place, "the step " + quote(name) + " is like itself");
      return;
    }
    const NodeRef body = tableOf(found->second);
    for (const auto& [key, value] : body->entries) {
      if (key->text == words::like) readLike(value->text, *value, bodies, reader, words, depth + 1);
    }
    reader.read(*body, words);
  }

  Source& source_;
  Tour& tour_;
  const SourceInputs& inputs_;
  Texts texts_;
  Mistakes mistakes_;
  Parts parts_;
};

}  // namespace

std::vector<Control> controlsOf(const walkthrough::StagePlan& plan, const std::string& resources) {
  const auto driver = requireDriver("memory");
  driver->setResourcePath(resources);
  walkthrough::Stage stage(*driver, plan);
  const auto picture = walkthrough::takePicture(*driver, stage.engine(), stage.title());
  std::vector<Control> controls;
  for (const auto& control : picture.controls) controls.push_back(controlOf(control.view));
  return controls;
}

bool isSourcePath(const std::string& path) {
  return path.ends_with(".yaml") || path.ends_with(".yml");
}

Source readSource(const std::string& path, const Translate& translate) {
  const auto text = wholeFile(path);
  if (!text) {
    throw Failure(ExitStatus::badInput,
                  path + ": cannot be read; expected a walk-through in steps");
  }
  return readSourceOf(path, *text, translate);
}

Source readSourceOf(const std::string& path, const std::string& text, const Translate& translate) {
  const std::string resources = fs::path(path).parent_path().string();
  const auto controls = [&](const walkthrough::StageOptions& stage) {
    return controlsOf(walkthrough::planStage(stage, {}, path), resources);
  };
  return readSourceText(path, text, {controls, includedText}, translate);
}

Source readSourceText(const std::string& path, std::string text, const SourceInputs& inputs,
                      const Translate& translate) {
  Source source{.path = path};
  SourceReader(source, inputs, translate).read(std::move(text));
  return source;
}

}  // namespace qz::tools::steps
