// SPDX-License-Identifier: MIT
// The properties of controls.

#include <cstdio>
#include <memory>
#include <utility>

#include "tools/scenario/properties.hpp"
#include "tools/scenario/property_table.hpp"
#include "tools/scenario/text_properties.hpp"
#include "tools/scenario/unmet.hpp"

namespace qz::tools::scenario {
namespace control_properties {
namespace {

using drivers::ViewPicture;

// --- reading ---

const toolkit::AttributedString& styledText(const drivers::ViewPicture& picture) {
  return isButton(picture.kind) ? picture.title : picture.text;
}

Reading className(const Stage&, const drivers::ViewPicture& picture) { return picture.className; }
Reading tag(const Stage&, const drivers::ViewPicture& picture) { return picture.tag; }
Reading hidden(const Stage&, const drivers::ViewPicture& picture) { return picture.hidden; }
Reading enabled(const Stage&, const drivers::ViewPicture& picture) { return picture.enabled; }
Reading highlighted(const Stage&, const drivers::ViewPicture& picture) {
  return picture.highlighted;
}
Reading toolTip(const Stage&, const drivers::ViewPicture& picture) { return picture.toolTip; }

Reading state(const Stage&, const drivers::ViewPicture& picture) {
  return static_cast<int>(picture.state);
}

Reading frame(const Stage&, const drivers::ViewPicture& picture) {
  const auto& frame = picture.frame;
  return Json{frame.x, frame.y, frame.width, frame.height};
}

Reading title(const Stage&, const drivers::ViewPicture& picture) {
  return isButton(picture.kind) ? Reading(picture.title.string()) : std::nullopt;
}

Reading text(const Stage&, const drivers::ViewPicture& picture) {
  return rowOf(picture.kind).isControl ? Reading(picture.text.string()) : std::nullopt;
}

Reading image(const Stage&, const drivers::ViewPicture& picture) {
  return picture.image ? Reading(*picture.image) : std::nullopt;
}

Reading action(const Stage&, const drivers::ViewPicture& picture) {
  return picture.action ? Reading(*picture.action) : std::nullopt;
}

Reading target(const Stage& stage, const drivers::ViewPicture& picture) {
  return showResponder(stage, picture.target);
}

Reading background(const Stage&, const drivers::ViewPicture& picture) {
  return picture.background ? Reading(showColor(*picture.background)) : std::nullopt;
}

template <ShowAttribute attribute>
Reading throughout(const Stage&, const drivers::ViewPicture& picture) {
  return showThroughout(styledText(picture), attribute);
}

Reading runs(const Stage&, const drivers::ViewPicture& picture) {
  return showRuns(styledText(picture));
}

// --- writing ---

using View = Cast::View;

toolkit::Ref<toolkit::Button> button(const View& view) {
  auto found = toolkit::asButton(view);
  if (!found) throw Unmet("a button", view->className());
  return found;
}

std::string textOf(const Wanted& value) {
  return value.kind == Wanted::Kind::absent ? "" : value.value.get<std::string>();
}

void setTag(Stage&, const View& view, const Wanted& value) {
  view->setTag(value.value.get<toolkit::Tag>());
}

void setFrame(Stage& stage, const View& view, const Wanted& value) {
  const auto& frame = value.value;
  const bool isFrame = frame.size() == 4 && std::all_of(frame.begin(), frame.end(), [](auto& part) {
                         return part.is_number();
                       });
  if (!isFrame) throw Unmet("[x, y, width, height]", show(frame));
  stage.driver.setFrame(view, {frame[0].template get<double>(), frame[1].get<double>(),
                               frame[2].get<double>(), frame[3].get<double>()});
}

void setHidden(Stage&, const View& view, const Wanted& value) {
  view->setHidden(value.value.get<bool>());
}

void setEnabled(Stage&, const View& view, const Wanted& value) {
  view->setEnabled(value.value.get<bool>());
}

void setState(Stage&, const View& view, const Wanted& value) {
  const auto state = value.value.get<std::int64_t>();
  if (state < -1 || state > 1) throw Unmet("-1, 0 or 1", std::to_string(state));
  button(view)->setState(static_cast<toolkit::State>(state));
}

void setHighlighted(Stage&, const View& view, const Wanted& value) {
  view->highlight(value.value.get<bool>());
}

void setCaption(Stage& stage, const View& view, const Wanted& value) {
  stage.driver.setCaption(view, textOf(value));
}

void setToolTip(Stage&, const View& view, const Wanted& value) { view->setToolTip(textOf(value)); }

void setAction(Stage&, const View& view, const Wanted& value) { view->setAction(textOf(value)); }

void setTarget(Stage& stage, const View& view, const Wanted& value) {
  const auto control = std::dynamic_pointer_cast<toolkit::Control>(view.pointer());
  if (!control) throw Unmet("a control that has a target", view->className());
  const auto target = textOf(value);
  if (target == "host") {
    control->setTarget(stage.host);
  } else if (target == "engine") {
    control->setTarget(stage.engines.existing());
  } else if (target.empty()) {
    control->setTarget(nullptr);
  } else {
    throw Unmet("engine, host or absent", inQuotes(target));
  }
}

void setBackground(Stage&, const View& view, const Wanted& value) {
  unsigned red = 0;
  unsigned green = 0;
  unsigned blue = 0;
  const auto text = textOf(value);
  if (text.size() != 7 || std::sscanf(text.c_str(), "#%2x%2x%2x", &red, &green, &blue) != 3) {
    throw Unmet("\"#rrggbb\"", inQuotes(text));
  }
  button(view)->setBackgroundColor({red / 255.0, green / 255.0, blue / 255.0});
}

// --- the table ---

struct Property {
  PropertyInfo info;
  Reading (*read)(const Stage& stage, const drivers::ViewPicture& picture);
  void (*write)(Stage& stage, const View& view, const Wanted& value);
};

constexpr Takes flag = Takes::flag;
constexpr Takes words = Takes::text;
constexpr Takes absent = Takes::absent;
constexpr Takes optionalText = Takes::text | Takes::absent | Takes::present | Takes::empty;
constexpr Takes list = Takes::list | Takes::empty;
constexpr Takes stateValue = Takes::whole | Takes::state;
constexpr Takes mixedFlag = Takes::flag | Takes::mixed;

constexpr Property properties[] = {
    {{"class", words, Takes::nothing, true}, className, nullptr},
    {{"tag", Takes::whole, Takes::whole}, tag, setTag},
    {{"frame", list, Takes::list}, frame, setFrame},
    {{"hidden", flag, flag}, hidden, setHidden},
    {{"enabled", flag, flag}, enabled, setEnabled},
    {{"state", stateValue, stateValue}, state, setState},
    {{"highlighted", flag, flag}, highlighted, setHighlighted},
    {{"title", optionalText, words}, title, setCaption},
    {{"text", optionalText, words}, text, setCaption},
    {{"tooltip", optionalText, words | absent}, toolTip, setToolTip},
    {{"image", optionalText, words | absent}, image, setCaption},
    {{"action", optionalText, words | absent}, action, setAction},
    {{"target", optionalText, words | absent}, target, setTarget},
    {{"background", optionalText, words}, background, setBackground},
    {{"font", optionalText}, throughout<showFont>, nullptr},
    {{"alignment", words}, throughout<showAlignment>, nullptr},
    {{"color", optionalText}, throughout<showForeground>, nullptr},
    {{"link", optionalText}, throughout<showLink>, nullptr},
    {{"bold", mixedFlag}, throughout<showBold>, nullptr},
    {{"italic", mixedFlag}, throughout<showItalic>, nullptr},
    {{"underline", mixedFlag}, throughout<showUnderline>, nullptr},
    {{"runs", list}, runs, nullptr},
};

}  // namespace
}  // namespace control_properties

std::vector<PropertyInfo> controlProperties() { return infosOf(control_properties::properties); }

Reading readControlProperty(Stage& stage, const Cast::View& control, std::string_view name) {
  return rowNamed(control_properties::properties, name).read(stage, stage.driver.look(control));
}

void writeControlProperty(Stage& stage, const Cast::View& control, std::string_view name,
                          const Wanted& value) {
  rowNamed(control_properties::properties, name).write(stage, control, value);
}

Reading showResponder(const Stage& stage, const std::shared_ptr<toolkit::Responder>& responder) {
  if (!responder) return std::nullopt;
  if (responder == stage.host) return "host";
  return responder == stage.engines.current() ? "engine" : "other";
}

}  // namespace qz::tools::scenario
