// SPDX-License-Identifier: MIT
// Follows the engine during one move, and notes the facts.
#pragma once

#include <cstdint>
#include <limits>
#include <optional>
#include <string>
#include <vector>

#include "qz/drivers/view_kinds.hpp"
#include "qz/observer.hpp"
#include "tools/exploration/facts.hpp"
#include "tools/exploration/place.hpp"
#include "tools/exploration/script.hpp"

namespace qz::tools::check {

/// The longest delay that a script can write, in seconds, rounded up as the engine does.
inline constexpr double longestDelay = 2147483648.0;

/// What stands for the time left of a timer that fires in no user's lifetime: its delay was
/// negative or an address, and is millions of years or more.
inline constexpr double neverFires = std::numeric_limits<double>::infinity();

/// What the recorder asks of the world in which the engine works.
class Surroundings {
 public:
  virtual ~Surroundings() = default;

  /// The engine has looked up a control, which the move may change from now on.
  virtual void willTouch(const toolkit::Ref<toolkit::View>& control) = 0;
  /// What the move does depends on which controls have this tag.
  virtual void tagWasSought(Tag tag) = 0;
  /// An element may have given a control another tag.
  virtual void tagMayHaveChanged(const toolkit::Ref<toolkit::View>& control,
                                 std::uint32_t element) = 0;
  /// The end may have given all controls their own tags back.
  virtual void tagsMayBeRestored() = 0;
  /// The script has set the state of a button.
  virtual void stateWasSet(const toolkit::Ref<toolkit::View>& control) = 0;
  virtual void lookMayHaveChanged(const toolkit::Ref<toolkit::View>& control) = 0;
  virtual std::size_t controlsWithTag(Tag tag) = 0;
  virtual drivers::ViewKind kindOf(const toolkit::Ref<toolkit::View>& control) const = 0;
};

class Recorder final : public Observer {
 public:
  /// Notes of the watched lists, by index, whether a move ran them. All must outlive the recorder.
  Recorder(const Script& script, Surroundings& surroundings, const std::vector<bool>& watched);

  /// Begins a move; what happens before the first move is not recorded.
  void begin();
  /// Ends the move. A timer that the move has left pending counts as firing if it is the first,
  /// unless the walk-through is over.
  void end(bool isOver);
  /// Gives up a move that would never end. Its facts remain; no timer fires after it.
  void abandon();
  void note(FactKind kind, Subject subject, std::string detail = {});

  /// Returns the facts of the move. A fact that is good news is there only the first time.
  const std::vector<Fact>& facts() const { return facts_; }
  /// Whether a fact of the move is there only because it is the first time.
  bool isFirstTime() const { return isFirstTime_; }
  /// Returns the timers that are pending, in the order of their firing.
  PendingTimers pending() const;
  /// Returns the elements that started those timers.
  std::vector<std::uint32_t> pendingElements() const;
  /// Returns the index of the list that the move ran first; absent if it ran none.
  std::optional<std::size_t> firstList() const { return firstList_; }
  /// Returns the index of the list that ended the walk-through; absent if none did.
  std::optional<std::size_t> endList() const { return endList_; }
  /// Returns the index of the list whose command ran last; absent if no command ran.
  std::optional<std::size_t> lastList() const { return lastList_; }
  /// Returns the indices of the watched lists that the move ran.
  const std::vector<std::uint32_t>& watchedLists() const { return watchedLists_; }
  /// Whether a command ran that can change the background, or what the engine notes of flashing.
  bool notesMayHaveChanged() const { return notesMayHaveChanged_; }
  /// Whether the move ran a list of the script.
  bool ranList() const { return ranList_; }

  void listWillRun(const Value& list, const ObjectId& id) override;
  void listDidRun(const Value& list, const ObjectId& id) override;
  void commandWillRun(const Value& list, std::size_t index) override;
  void commandDidRun(const Value& list, std::size_t index, bool result) override;
  void commandRaised(const Value& list, std::size_t index,
                     const toolkit::Exception& exception) override;
  void controlSought(Tag tag, const toolkit::Ref<toolkit::View>& control) override;
  void timerSet(std::string_view key, double seconds) override;
  void timerFired(std::string_view key) override;
  void timerCancelled(std::string_view key) override;

 private:
  /// A list that is running, and its command.
  struct Running {
    std::optional<std::size_t> list;
    Tag id = 0;
    std::size_t element = 0;  // its number in the script
    const Element* command = nullptr;
    std::optional<Tag> target{};
    std::optional<toolkit::Ref<toolkit::View>> found{};  // the control that had the target's tag
  };
  struct Timer {
    PendingTimer timer;
    std::optional<std::size_t> element;  // which started it
  };

  void noteOnce(FactKind kind, std::size_t subject);
  void noteTarget(const Running& running);
  void throwIfEndless(const std::optional<std::size_t>& list);
  void forget(std::string_view key);

  const Script& script_;
  Surroundings& surroundings_;
  const std::vector<bool>& watched_;
  bool isRecording_ = false;
  std::vector<Running> running_;
  std::vector<Timer> timers_;
  std::vector<Fact> facts_;
  std::vector<std::uint32_t> noted_;  // bits of FactKind, by the subject
  std::vector<std::uint32_t> watchedLists_;
  std::optional<std::size_t> firstList_;
  std::optional<std::size_t> endList_;
  std::optional<std::size_t> lastList_;
  bool isFirstTime_ = false;
  bool ranList_ = false;
  bool notesMayHaveChanged_ = false;
};

}  // namespace qz::tools::check
