// SPDX-License-Identifier: MIT
// The properties of windows.

#include "tools/scenario/properties.hpp"
#include "tools/scenario/property_table.hpp"
#include "tools/scenario/text_properties.hpp"

namespace qz::tools::scenario {
namespace window_properties {
namespace {

using drivers::WindowPicture;
using Window = Cast::Window;

Reading visible(const Stage&, const Window&, const drivers::WindowPicture& picture) {
  return picture.visible;
}

Reading key(const Stage&, const Window&, const drivers::WindowPicture& picture) {
  return picture.key;
}
Reading closes(const Stage&, const Window&, const drivers::WindowPicture& picture) {
  return picture.closes;
}
Reading style(const Stage&, const Window&, const drivers::WindowPicture& picture) {
  return picture.style;
}
Reading layered(const Stage&, const Window&, const drivers::WindowPicture& picture) {
  return picture.layered;
}

Reading rect(const Stage&, const Window&, const drivers::WindowPicture& picture) {
  const auto& content = picture.content;
  return Json{content.x, content.y, content.width, content.height};
}

Reading background(const Stage&, const Window&, const drivers::WindowPicture& picture) {
  return showColor(picture.background);
}

Reading delegate(const Stage& stage, const Window&, const drivers::WindowPicture& picture) {
  return showResponder(stage, picture.delegate);
}

Reading layerImage(const Stage&, const Window&, const drivers::WindowPicture& picture) {
  return picture.layerImage ? Reading(*picture.layerImage) : std::nullopt;
}

Reading sheetOf(const Stage& stage, const Window&, const drivers::WindowPicture& picture) {
  const auto name = stage.cast.nameOf(picture.sheetOf);
  return name ? Reading(*name) : std::nullopt;
}

Reading sheetEnds(const Stage&, const Window&, const drivers::WindowPicture& picture) {
  return picture.sheetEnds;
}

Reading subviews(const Stage&, const Window& window, const drivers::WindowPicture&) {
  auto names = Json::array();
  for (const auto& view : window->contentView()->subviews()) names.push_back(view->className());
  return names;
}

struct Property {
  PropertyInfo info;
  Reading (*read)(const Stage& stage, const Window& window, const drivers::WindowPicture& picture);
};

constexpr Takes flag = Takes::flag;
constexpr Takes words = Takes::text;
constexpr Takes whole = Takes::whole;
constexpr Takes list = Takes::list | Takes::empty;
constexpr Takes shown = Takes::absent | Takes::present;

constexpr Property properties[] = {
    {{"visible", flag}, visible},
    {{"key", flag}, key},
    {{"closes", whole}, closes},
    {{"rect", list}, rect},
    {{"background", words | shown}, background},
    {{"delegate", words | shown}, delegate},
    {{"layerimage", words | shown}, layerImage},
    {{"layered", flag}, layered},
    {{"sheetof", Takes::window | shown}, sheetOf},
    {{"sheetends", list}, sheetEnds},
    {{"subviews", list, Takes::nothing, true}, subviews},
    {{"style", whole}, style},
};

}  // namespace
}  // namespace window_properties

std::vector<PropertyInfo> windowProperties() { return infosOf(window_properties::properties); }

Reading readWindowProperty(Stage& stage, const Cast::Window& window, std::string_view name) {
  return rowNamed(window_properties::properties, name)
      .read(stage, window, stage.driver.look(window));
}

}  // namespace qz::tools::scenario
