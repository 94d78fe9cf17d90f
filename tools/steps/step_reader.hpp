// SPDX-License-Identifier: MIT
// Reads what a source says of one step.
#pragma once

#include <map>
#include <string>

#include "tools/steps/tour.hpp"
#include "tools/steps/yaml.hpp"

namespace qz::tools::steps {

class StepReader {
 public:
  /// `steps` are the names of all steps.
  StepReader(const std::vector<Control>& controls, const std::map<std::string, StepIndex>& steps,
             Mistakes& mistakes);

  /// Adds what `body` says to `words`; what it says replaces what was said before. `body` is a table
  /// without fragments; a name may occur in it several times.
  void read(const Node& body, StepWords& words) const;

 private:
  void readEntry(const Node& key, const NodeRef& value, StepWords& words) const;
  void readControl(ControlIndex control, const NodeRef& value, StepWords& words) const;
  void readProperty(ControlIndex control, const Node& key, const NodeRef& value,
                    ControlWords& words) const;
  void readContent(ControlIndex control, const Node& value, ControlWords& words) const;
  void readFont(const Node& value, ControlWords& words) const;
  void readWait(const Node& key, const NodeRef& value, StepWords& words) const;
  std::optional<Lead> readLead(const Node& value) const;
  /// Returns the control with that name; absent, and a mistake, if there is none.
  std::optional<ControlIndex> controlNamed(const Node& name) const;

  /// A word that names controls: `hide: [usb, wifi]`, or with a value for each: `font: {title: …}`.
  template <class Set>
  void forEachName(const Node& value, const Set& set) const;
  template <class Set>
  void forEachEntry(const NodeRef& value, const Set& set) const;

  const std::vector<Control>& controls_;
  const std::map<std::string, StepIndex>& steps_;
  std::map<std::string, ControlIndex> names_;
  Mistakes& mistakes_;
};

}  // namespace qz::tools::steps
