// SPDX-License-Identifier: MIT
#include "tools/exploration/looks.hpp"

#include <cstring>

namespace qz::tools::check {
namespace {

/// Writes values one after the other, so that equal texts mean equal values.
class Key {
 public:
  void add(double number) { addBytes(number); }
  void add(bool flag) { text_ += flag ? '1' : '0'; }
  void add(std::string_view text) {
    addBytes(text.size());
    text_ += text;
  }
  void add(const toolkit::Color& color) {
    add(color.red);
    add(color.green);
    add(color.blue);
    add(color.alpha);
  }
  void add(const toolkit::Ref<toolkit::Image>& image) {
    add(static_cast<bool>(image));
    if (image) add(std::string_view(image->name()));
  }
  void add(const toolkit::Font& font) {
    add(std::string_view(font.family));
    add(font.size);
    add(font.bold);
    add(font.italic);
  }
  void add(const toolkit::ParagraphStyle& style) {
    addNumber(style.alignment);
    add(style.firstLineHeadIndent);
    add(style.headIndent);
  }
  void add(const toolkit::TextAttributes& attributes) {
    addIfAny(attributes.font);
    addIfAny(attributes.foregroundColor);
    addIfAny(attributes.backgroundColor);
    addIfAny(attributes.paragraphStyle);
    add(attributes.link.has_value());
    if (attributes.link) add(std::string_view(attributes.link->address()));
    add(attributes.underline);
    add(attributes.strikethrough);
    addNumber(attributes.superscript);
  }
  void add(const toolkit::AttributedString& text) {
    add(std::string_view(text.string()));
    for (const auto& run : text.runs()) {
      addBytes(run.range.length);
      add(run.attributes);
    }
  }
  template <class T>
  void addIfAny(const std::optional<T>& value) {
    add(value.has_value());
    if (value) add(*value);
  }
  template <class Enumerator>
  void addNumber(Enumerator value) {
    add(static_cast<double>(static_cast<int>(value)));
  }

  std::string take() { return std::move(text_); }

 private:
  template <class T>
  void addBytes(const T& value) {
    const auto* const bytes = reinterpret_cast<const char*>(&value);
    text_.append(bytes, sizeof value);
  }

  std::string text_;
};

std::string keyOf(const ViewLook& look) {
  const SavedView& view = look.view;
  Key key;
  key.add(std::string_view(view.toolTip));
  key.add(view.wantsLayer);
  key.add(view.layerContents);
  key.add(view.text);
  key.add(view.title);
  key.add(look.hasUsersState);
  if (!look.hasUsersState) key.addNumber(view.state);
  key.addIfAny(view.background);
  key.addNumber(view.bezel);
  key.add(view.image);
  key.addNumber(view.frameStyle);
  key.addNumber(view.scaling);
  key.addNumber(view.imageAlignment);
  return key.take();
}

}  // namespace

Looks::Looks() : looks_(flashingAllowed + notedYes + 1) {}

LookValue Looks::valueOf(const ViewLook& look) {
  const std::string key = keyOf(look);
  const std::lock_guard lock(mutex_);
  const auto [place, isNew] = values_.emplace(key, static_cast<LookValue>(looks_.size()));
  if (isNew) looks_.push_back(look);
  return place->second;
}

const ViewLook& Looks::look(LookValue value) const {
  const std::lock_guard lock(mutex_);
  return looks_[value];
}

std::uint32_t Looks::numberOf(const Parts& parts) {
  const std::lock_guard lock(mutex_);
  const auto [place, isNew] = numbers_.emplace(parts, static_cast<std::uint32_t>(wholes_.size()));
  if (isNew) wholes_.push_back(&place->first);
  return place->second;
}

std::size_t Looks::count() const {
  const std::lock_guard lock(mutex_);
  return wholes_.size();
}

const Looks::Parts& Looks::parts(std::uint32_t number) const {
  const std::lock_guard lock(mutex_);
  return *wholes_[number];
}

}  // namespace qz::tools::check
