// SPDX-License-Identifier: MIT
// Reads what a source says of one step.
#pragma once

#include <map>
#include <string>

#include "tools/steps/texts.hpp"
#include "tools/steps/tour.hpp"
#include "tools/steps/yaml.hpp"

namespace qz::tools::steps {

class StepReader {
 public:
  /// `steps` are the names of all steps.
  StepReader(const std::vector<Control>& controls, const std::map<std::string, StepIndex>& steps,
             Texts& texts, Mistakes& mistakes);

  /// Adds what `body` says to `words`; what it says replaces what was said before. `body` is a
  /// table without fragments; a name may occur in it several times.
  void read(const Node& body, StepWords& words) const;

 private:
  struct StepWordRow;
  struct PropertyRow;
  static const StepWordRow stepWords[];
  static const PropertyRow properties[];

  void readEntry(const Node& key, const NodeRef& value, StepWords& words) const;
  void refuseEntry(const Node& key) const;
  /// Reads names of controls: `hide: [usb, wifi]`.
  template <std::optional<bool> ControlWords::*flag, bool value>
  void readNames(const NodeRef& names, const PropertyRow& row, StepWords& words) const;
  /// Reads a value for each control: `font: {heading: Helvetica 18}`.
  void readEach(const NodeRef& values, const PropertyRow& row, StepWords& words) const;
  void readWait(const Node& key, const NodeRef& value, StepWords& words) const;
  std::optional<Lead> readWaitTable(const Node& table, Wait& wait) const;

  void readControl(ControlIndex control, const NodeRef& value, StepWords& words) const;
  void readProperty(ControlIndex control, const Node& key, const Node& value,
                    ControlWords& words) const;
  void readContent(ControlIndex control, const Node& value, ControlWords& words) const;
  void readHtml(ControlIndex control, const Node& value, ControlWords& words) const;
  void readFont(ControlIndex control, const Node& value, ControlWords& words) const;
  void readAlign(ControlIndex control, const Node& value, ControlWords& words) const;
  void readToolTip(ControlIndex control, const Node& value, ControlWords& words) const;
  void readColor(ControlIndex control, const Node& value, ControlWords& words) const;
  void readRed(ControlIndex control, const Node& value, ControlWords& words) const;
  void readState(ControlIndex control, const Node& value, ControlWords& words) const;
  template <std::optional<bool> ControlWords::*flag>
  void readFlag(ControlIndex control, const Node& value, ControlWords& words) const;
  void readPress(ControlIndex control, const Node& value, ControlWords& words) const;

  /// Returns a text in the language of the script; absent, and a mistake, if the node is not a
  /// text.
  std::optional<std::string> translatedText(ControlIndex control, std::string_view property,
                                            const Node& value) const;
  std::optional<Lead> readLead(const Node& value) const;
  std::optional<Lead> readInstead(const Node& table) const;
  /// Returns the control with that name; absent, and a mistake, if there is none.
  std::optional<ControlIndex> controlNamed(const Node& name) const;
  /// Returns the row of a property; null if no property has this name.
  static const PropertyRow* propertyNamed(std::string_view word);
  /// Whether controls of this kind have the property. If not, that is a mistake at `at`.
  bool has(ControlIndex control, const PropertyRow& row, const Node& at) const;

  const std::vector<Control>& controls_;
  const std::map<std::string, StepIndex>& steps_;
  std::map<std::string, ControlIndex> names_;
  Texts& texts_;
  Mistakes& mistakes_;
};

}  // namespace qz::tools::steps
