// SPDX-License-Identifier: MIT
// Writes sources and windows.
#include "tests/steps/source_writer.hpp"

#include <algorithm>
#include <cctype>

namespace qz::meaning {

namespace {

using Entries = std::vector<std::pair<std::string, std::string>>;  // keys and values in YAML

std::string quoted(const std::string& text) {
  std::string out = "\"";
  for (const char c : text) {
    if (c == '"' || c == '\\') out += '\\';
    out += c;
  }
  return out + '"';
}

std::string flow(const Entries& entries) {
  std::string out;
  for (const auto& [key, value] : entries) out += (out.empty() ? "" : ", ") + key + ": " + value;
  return "{" + out + "}";
}

std::string flow(const std::vector<std::string>& list) {
  std::string out;
  for (const std::string& each : list) out += (out.empty() ? "" : ", ") + each;
  return "[" + out + "]";
}

/// Writes the entries of one part.
class PartWriter {
 public:
  PartWriter(const Tour& tour, Dice& dice) : tour_(tour), dice_(dice) {}

  Entries write(const Part& part) {
    for (const auto& [name, words] : part.controls) writeControl(name, words);
    writeLists();
    writeStepWords(part);
    shuffle(entries_);
    return entries_;
  }

  std::string text(const std::string& text) {
    const bool isSafe = !text.empty() && std::all_of(text.begin(), text.end(), [](char c) {
      return std::isalpha(static_cast<unsigned char>(c)) != 0;
    });
    return isSafe && dice_.oneIn(2) ? text : quoted(text);
  }

 private:
  template <class List>
  void shuffle(List& list) {
    for (std::size_t i = list.size(); i > 1; --i) std::swap(list[i - 1], list[dice_.below(i)]);
  }

  ViewKind kindOf(const std::string& name) {
    const auto is = [&](const HostControl& control) { return control.name == name; };
    return std::find_if(tour_.controls.begin(), tour_.controls.end(), is)->kind;
  }

  static std::string flag(bool flag) { return flag ? "yes" : "no"; }

  std::string press(const std::string& target) {
    if (!target.starts_with(instead)) return text(target);
    return flow(Entries{{"instead", text(target.substr(instead.size()))}});
  }

  void writeControl(const std::string& name, const Words& words) {
    Entries properties;
    writeContents(name, words, properties);
    writeLook(name, words, properties);
    if (!words.isEntry) return;
    shuffle(properties);
    const bool isShort =
        properties.size() == 1 && words.content && !words.content->isHtml && dice_.oneIn(2);
    entries_.emplace_back(text(name), isShort ? properties[0].second : flow(properties));
  }

  void writeContents(const std::string& name, const Words& words, Entries& properties) {
    const auto caption = rowOf(kindOf(name)).caption;
    const std::string key = caption == drivers::Caption::text    ? "text"
                            : caption == drivers::Caption::title ? "title"
                                                                 : "picture";
    if (words.content) {
      properties.emplace_back(words.content->isHtml ? "html" : key, text(words.content->written));
    }
    if (words.toolTip) properties.emplace_back("tooltip", text(*words.toolTip));
    if (words.color) properties.emplace_back("color", text(*words.color));
    if (words.isRed) properties.emplace_back("background", "red");
    if (words.isOn) properties.emplace_back("state", *words.isOn ? "on" : "off");
    if (words.press) properties.emplace_back("press", press(*words.press));
  }

  void writeLook(const std::string& name, const Words& words, Entries& properties) {
    const auto isProperty = [&] { return words.isEntry && dice_.oneIn(2); };
    const auto write = [&](const auto& said, auto property, auto word) {
      if (said) isProperty() ? property() : word();
    };
    const auto asFlag = [&](const char* key, const std::optional<bool>& said, const char* yes,
                            const char* no) {
      write(
          said, [&] { properties.emplace_back(key, flag(*said)); },
          [&] { lists_[*said ? yes : no].push_back(text(name)); });
    };
    asFlag("shown", words.isShown, "show", "hide");
    asFlag("enabled", words.isEnabled, "enable", "disable");
    if (words.flashes && !*words.flashes) {
      properties.emplace_back("flash", "no");
    } else {
      asFlag("flash", words.flashes, "flash", "");
    }
    write(
        words.font, [&] { properties.emplace_back("font", text(*words.font)); },
        [&] { fonts_.emplace_back(text(name), text(*words.font)); });
    const std::string align = words.isCentered.value_or(false) ? "center" : "natural";
    write(
        words.isCentered, [&] { properties.emplace_back("align", align); },
        [&] { aligns_.emplace_back(text(name), align); });
  }

  void writeLists() {
    for (const auto& [word, names] : lists_) {
      const bool isOne = names.size() == 1 && dice_.oneIn(2);
      entries_.emplace_back(word, isOne ? names[0] : flow(names));
    }
    if (!fonts_.empty()) entries_.emplace_back("font", flow(fonts_));
    if (!aligns_.empty()) entries_.emplace_back("align", flow(aligns_));
  }

  void writeStepWords(const Part& part) {
    if (part.background) entries_.emplace_back("background", text(*part.background));
    if (part.wait) writeWait(*part.wait);
    if (part.isPassedOver) entries_.emplace_back("back passes over", flag(*part.isPassedOver));
    if (!part.like.empty()) entries_.emplace_back("like", text(part.like));
    if (!part.uses.empty()) entries_.emplace_back("use", uses(part.uses));
  }

  void writeWait(const Wait& wait) {
    const std::string key = "after " + std::to_string(wait.seconds) + " s";
    if (!wait.givesUp && dice_.oneIn(2)) return entries_.emplace_back(key, text(wait.go)), void();
    const char* const others = wait.givesUp ? "give up" : "start again";
    entries_.emplace_back(key, flow(Entries{{"go", text(wait.go)}, {"other presses", others}}));
  }

  std::string uses(const std::vector<Use>& all) {
    const bool areBare =
        std::all_of(all.begin(), all.end(), [](const Use& use) { return use.arguments.empty(); });
    if (areBare && all.size() == 1 && dice_.oneIn(2)) return text(all[0].fragment);
    std::vector<std::string> names;
    Entries table;
    for (const Use& use : all) {
      Entries arguments;
      for (const auto& [name, value] : use.arguments) {
        arguments.emplace_back(text(name), text(value));
      }
      names.push_back(text(use.fragment));
      table.emplace_back(names.back(), flow(arguments));
    }
    return areBare && dice_.oneIn(2) ? flow(names) : flow(table);
  }

  const Tour& tour_;
  Dice& dice_;
  Entries entries_{};
  std::map<std::string, std::vector<std::string>> lists_{};
  Entries fonts_{};
  Entries aligns_{};
};

std::string indented(const Entries& entries) {
  std::string out;
  for (const auto& [key, value] : entries) out += "\n    " + key + ": " + value;
  return out;
}

std::string entryOf(const HostControl& control, int place) {
  const auto& row = rowOf(control.kind);
  std::string out = "  { class = " + quoted(std::string(row.name)) +
                    "; tag = " + std::to_string(control.tag) + "; frame = (10, " +
                    std::to_string(10 + 40 * place) + ", 300, 30);";
  if (row.caption == drivers::Caption::imageName) {
    if (!control.caption.empty()) out += " image = " + quoted(control.caption) + ";";
  } else if (row.caption != drivers::Caption::none) {
    out += " title = " + quoted(control.caption) + ";";
  }
  if (!control.toolTip.empty()) out += " toolTip = " + quoted(control.toolTip) + ";";
  if (!control.isShown) out += " hidden = YES;";
  if (!control.isEnabled) out += " enabled = NO;";
  if (control.state == toolkit::State::on) out += " state = on;";
  if (control.state == toolkit::State::mixed) out += " state = mixed;";
  return out + " }";
}

}  // namespace

std::string yamlOf(const Tour& tour, Dice& dice) {
  const auto entriesOf = [&](const Part& part) { return PartWriter(tour, dice).write(part); };
  const auto written = [&](const Part& part) {
    const Entries entries = entriesOf(part);
    return entries.empty() || dice.oneIn(2) ? " " + flow(entries) : indented(entries);
  };
  PartWriter writer(tour, dice);
  std::string out = "window: host.plist\n";
  if (tour.backOver) out += "back over: " + std::to_string(*tour.backOver) + "\n";
  Entries names;
  for (const HostControl& control : tour.controls) {
    if (control.name.empty()) continue;
    names.emplace_back(writer.text(control.name), std::to_string(control.tag));
  }
  out += "controls: " + flow(names) + "\n";
  const Entries common = entriesOf(tour.everyStep);
  if (!common.empty()) out += "every step: " + flow(common) + "\n";
  if (!tour.fragments.empty()) out += "fragments:\n";
  for (const auto& [name, part] : tour.fragments) {
    out += "  " + writer.text(name) + ":" + written(part) + "\n";
  }
  out += "steps:\n";
  for (const auto& [name, part] : tour.steps) {
    out += "  " + writer.text(name) + ":" + written(part) + "\n";
  }
  return out;
}

std::string windowOf(const Tour& tour) {
  std::string out;
  for (const HostControl& control : tour.controls) {
    const int place = static_cast<int>(&control - tour.controls.data());
    out += (out.empty() ? "(\n" : ",\n") + entryOf(control, place);
  }
  return out + "\n)\n";
}

}  // namespace qz::meaning
