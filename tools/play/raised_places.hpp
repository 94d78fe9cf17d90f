// SPDX-License-Identifier: MIT
// Reports the place in the script of each command that raises: the engine's log line does not.
#pragma once

#include <iosfwd>
#include <optional>
#include <string>
#include <vector>

#include "qz/engine.hpp"
#include "qz/observer.hpp"
#include "tools/support/input_file.hpp"

namespace qz::tools::play {

class RaisedPlaces final : public qz::Observer {
 public:
  /// The arguments must outlive the observer. `script` is the file that the engine loads.
  RaisedPlaces(const InputFile& script, const QZ_Plist_State_Parser& engine, std::ostream& log)
      : script_(script), engine_(engine), log_(log) {}

  void listWillRun(const Value& list, const ObjectId& id) override;
  void listDidRun(const Value& list, const ObjectId& id) override;
  void commandRaised(const Value& list, std::size_t index,
                     const toolkit::Exception& exception) override;

 private:
  const InputFile& script_;
  const QZ_Plist_State_Parser& engine_;
  std::ostream& log_;
  std::vector<std::optional<std::string>> running_;  // the keys of the lists, the outermost first
};

}  // namespace qz::tools::play
