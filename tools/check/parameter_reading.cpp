// SPDX-License-Identifier: MIT
#include "tools/check/parameter_reading.hpp"

#include <algorithm>
#include <filesystem>
#include <utility>

#include "text/ascii.hpp"
#include "text/utf8.hpp"
#include "tools/support/input_file.hpp"
#include "tools/support/suggestions.hpp"
#include "tools/support/text_layout.hpp"

namespace qz::tools::check {
namespace {

using toolkit::asNumber;
using toolkit::asString;

constexpr double anySize = 12;  // fonts are known by their names at every size

bool isNumberType(ParameterType type) {
  switch (type) {
    case ParameterType::controlTag:
    case ParameterType::listTag:
    case ParameterType::controlOrListTag:
    case ParameterType::newTag:
    case ParameterType::seconds:
    case ParameterType::points:
    case ParameterType::integer:
      return true;
    default:
      return false;
  }
}

/// Whether `text` is a whole number: blanks, a sign, digits, and nothing behind them.
bool isWholeNumber(std::string_view text) {
  const auto begin = text.find_first_not_of(" \t\n\r\f\v");
  if (begin == std::string_view::npos) return false;
  text.remove_prefix(begin);
  if (text.front() == '+' || text.front() == '-') text.remove_prefix(1);
  return !text.empty() &&
         std::all_of(text.begin(), text.end(), [](char c) { return c >= '0' && c <= '9'; });
}

/// Returns the first character of `text` that is not ASCII, and its number.
std::pair<std::string, std::uint32_t> firstBeyondAscii(std::string_view text) {
  std::size_t end = 0;
  while (end < text.size()) {
    const std::size_t begin = end;
    const char32_t character = text::nextCodePoint(text, end);
    if (character > 0x7f) return {std::string(text.substr(begin, end - begin)), character};
  }
  return {"", 0};
}

std::string plural(std::size_t count, const std::string& noun) {
  return std::to_string(count) + " " + noun + (count == 1 ? "" : "s");
}

class ParameterReader {
 public:
  ParameterReader(const Element& element, toolkit::Toolkit& toolkit)
      : element_(element), command_(*element.command), toolkit_(toolkit) {}

  std::vector<Finding> findings() {
    readCount();
    const std::size_t count = std::min(element_.parameterCount(), command_.parameters.size());
    for (std::size_t i = 0; i < count; ++i) readParameter(i);
    if (command_.positionOf(ParameterType::anything)) readUselessDelay();
    return std::move(findings_);
  }

 private:
  void readCount() {
    const std::size_t given = element_.parameterCount();
    const std::size_t needed = neededParameters();
    if (given < needed) {
      add(findingOf("missing-parameter",
                    command_.name + " needs " + plural(needed, "parameter") + " and has " +
                        (given == 0 ? "none" : std::to_string(given)) + "; it does nothing",
                    "add the " + std::string(command_.parameters[given].name) + ": " +
                        std::string(command_.parameters[given].meaning)));
    }
    if (given > command_.parameters.size()) tooMany(given);
  }

  std::size_t neededParameters() const {
    const auto& all = command_.parameters;
    const auto isNeeded = [](const CommandParameter& each) { return !each.isOptional; };
    return static_cast<std::size_t>(std::count_if(all.begin(), all.end(), isNeeded));
  }

  void tooMany(std::size_t given) {
    const std::string most =
        command_.parameters.empty() ? "none" : std::to_string(command_.parameters.size());
    std::string message = command_.name + " takes " +
                          (command_.parameters.empty() ? "no parameter" : "at most " + most) +
                          " and has " + std::to_string(given);
    Severity severity = Severity::warning;
    switch (command_.extraParameters) {
      case ExtraParameters::ignored:
        message += "; the engine ignores the rest";
        break;
      case ExtraParameters::overrideTheTag:
        message += "; the engine then ignores the tag, too, and takes the control of the list";
        break;
      case ExtraParameters::preventTheCommand:
        message += "; the command then does nothing";
        severity = Severity::error;
        break;
    }
    Finding finding =
        findingOf("extra-parameter", message, "delete the parameters from this one on");
    finding.severity = severity;
    finding.where = element_.parameter(command_.parameters.size());
    add(std::move(finding));
  }

  void readParameter(std::size_t position) {
    const CommandParameter& parameter = command_.parameters[position];
    const auto value = element_.parameter(position);
    if (!isRead(position)) return;
    if (!hasRightType(parameter.type, value)) {
      addAt(value, wrongType(parameter, value));
    } else if (isNumberType(parameter.type)) {
      readNumber(parameter, value);
    } else {
      readName(parameter, value);
    }
  }

  Finding wrongType(const CommandParameter& parameter, const ValueRef<>& value) const {
    return findingOf("wrong-type",
                     "the " + std::string(parameter.name) + " of " + command_.name + " is " +
                         foundWords(value) + ", so the command fails",
                     "write " + wanted(parameter.type));
  }

  /// Whether the command looks at the parameter: fonts do not matter for HTML as it is.
  bool isRead(std::size_t position) const {
    const auto asIs = command_.positionOf(ParameterType::flag);
    if (!asIs || command_.parameters[position].type != ParameterType::fontName) return true;
    const auto flag = element_.parameter(*asIs);
    return !(asString(flag) || asNumber(flag)) || !flag->boolValue();
  }

  static bool hasRightType(ParameterType type, const ValueRef<>& value) {
    if (type == ParameterType::anything || type == ParameterType::html) return true;
    if (isNumberType(type) || type == ParameterType::flag) {
      return asString(value) || asNumber(value);
    }
    return static_cast<bool>(asString(value));
  }

  static std::string wanted(ParameterType type) {
    if (isNumberType(type)) return "a whole number";
    return type == ParameterType::flag ? "YES or NO" : "a string";
  }

  void readNumber(const CommandParameter& parameter, const ValueRef<>& value) {
    const auto text = asString(value);
    if (!text || isWholeNumber(text->text())) return;
    addAt(value, findingOf("not-a-number",
                           "the " + std::string(parameter.name) + " of " + command_.name + " is " +
                               quote(text->text()) + ", which the engine reads as " +
                               std::to_string(text->intValue()),
                           "write a whole number"));
  }

  void readName(const CommandParameter& parameter, const ValueRef<>& value) {
    switch (parameter.type) {
      case ParameterType::html:
        return readHtml(value);
      case ParameterType::fontName:
        return readFont(value);
      case ParameterType::imageName:
        return readImage(value);
      case ParameterType::colorName:
        return readColor(value);
      default:
        return;
    }
  }

  void readHtml(const ValueRef<>& value) {
    const std::string html = value->description();
    if (text::asciiBytes(html)) return;
    const auto [character, number] = firstBeyondAscii(html);
    addAt(value, findingOf("not-ascii",
                           "the HTML has the character " + quote(character) +
                               ", which is not ASCII, so the engine shows nothing",
                           "write &#" + std::to_string(number) + "; instead"));
  }

  void readFont(const ValueRef<>& value) {
    const std::string name = value->description();
    if (toolkit_.fonts().fontWithName(name, anySize)) return;
    addAt(value,
          findingOf("unknown-font", "no font is called " + quote(name) + "; the text is not shown",
                    "use a font that every user has, such as Helvetica"));
  }

  void readImage(const ValueRef<>& value) {
    const std::string name = value->description();
    if (toolkit_.images().imageNamed(name)) return;
    const std::string stem = std::filesystem::path(name).stem().string();
    const bool isNamed = stem != name && toolkit_.images().imageNamed(stem);
    addAt(value, findingOf("unknown-image",
                           "no image is called " + quote(name) + " in " +
                               toolkit_.files().resourcePath() + "; nothing is shown in its place",
                           isNamed ? "write the name only: " + stem
                                   : "put the image there, or name another directory with "
                                     "--resources"));
  }

  void readColor(const ValueRef<>& value) {
    const std::string name = value->description();
    const auto known = titleColorNames();
    if (std::find(known.begin(), known.end(), name) != known.end()) return;
    addAt(value, findingOf("unknown-color",
                           "no colour is called " + quote(name) + "; the title keeps its colour",
                           "use " + enumerate({known.begin(), known.end()}) +
                               didYouMean(name, {known.begin(), known.end()})));
  }

  void readUselessDelay() {
    addAt(element_.parameter(*command_.positionOf(ParameterType::anything)),
          findingOf("useless-delay",
                    "the delay of " + command_.name +
                        " is very long whatever is written, so the timer never fires",
                    "use SET_TAG_FOR_OBJECT_ID, and SET_TIMER_FOR_ID for the new tag"));
  }

  void addAt(const ValueRef<>& where, Finding finding) {
    finding.where = where;
    add(std::move(finding));
  }
  void add(Finding finding) { findings_.push_back(std::move(finding)); }

  const Element& element_;
  const Command& command_;
  toolkit::Toolkit& toolkit_;
  std::vector<Finding> findings_;
};

}  // namespace

std::vector<Finding> readParameters(const Element& element, toolkit::Toolkit& toolkit) {
  return ParameterReader(element, toolkit).findings();
}

}  // namespace qz::tools::check
