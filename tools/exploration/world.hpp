// SPDX-License-Identifier: MIT
// A world: a toolkit, a window and an engine, which can be brought to any place directly and make
// one move from there.
#pragma once

#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <unordered_map>
#include <vector>

#include "drivers/memory/memory_driver.hpp"
#include "tools/exploration/arrival.hpp"
#include "tools/exploration/looks.hpp"
#include "tools/exploration/place.hpp"
#include "tools/exploration/recorder.hpp"
#include "tools/exploration/remembered_presses.hpp"
#include "tools/exploration/script.hpp"
#include "tools/walkthrough/stage.hpp"

namespace qz::tools::check {

/// What all worlds of one check share. The references must outlive the worlds.
struct Setting {
  const Script& script;
  const walkthrough::StagePlan& plan;
  std::string resources;            ///< the directory of the images
  std::vector<Tag> ownTags{};       ///< of the window's controls, before the start
  std::vector<SavedView> before{};  ///< the window's controls, before the start
  std::vector<drivers::ViewKind> kinds{};
  std::vector<std::string> flashKeys;  ///< the tag keys that the script can make flash
  std::vector<bool> watchedLists{};    ///< by index: arrivals say whether the move ran it; or empty
  bool tracksTaggers = false;  ///< which element gave each control its tag is a part of the look
  bool wholeLooks = false;     ///< what two controls show together matters, not only each by itself
  bool exactStates = false;    ///< the states that the user made are parts of the look
};

/// Reads from a world of its own what all worlds share.
Setting settingOf(const Script& script, const walkthrough::StagePlan& plan, std::string resources);

/// Returns the tag that the end of a walk-through gives to a control whose own tag is `tag`: the
/// engine takes it as an `int`.
Tag restoredTag(Tag tag);

class World final : private Surroundings {
 public:
  World(const Setting& setting, const PlaceFormat& format, Looks& looks);
  ~World() override;

  /// The walk-through starts, in a window as the host made it. Writes where that leads to `place`.
  Arrival start(const std::string& key, PendingTimers& timers, std::uint8_t* place);
  /// Makes a move from a place, whose pending timers are `pending`.
  Arrival make(Move move, const Station& from, const PendingTimers& pending, PendingTimers& timers,
               std::uint8_t* place);

  /// Returns the moves from a place.
  std::vector<Move> moves(const std::uint8_t* place, const PendingTimers& pending) const;
  /// Returns the number of the look that the world shows.
  std::uint32_t look() const { return look_; }
  /// Returns the facts of the last move. A fact that is good news is there only the first time.
  const std::vector<Fact>& facts() const { return *facts_; }

 private:
  struct Control {
    std::shared_ptr<toolkit::memory::ViewNode> node;
    toolkit::Ref<toolkit::View> view;
    toolkit::memory::MemoryButton* button = nullptr;  // null for another kind
    ControlState state{};
    LookValue look = 0;
    bool showsState = false;
    bool hasUsersState = false;
    bool isTouched = false;
    bool mayLookDifferent = false;
  };

  // Surroundings:
  void willTouch(const toolkit::Ref<toolkit::View>& view) override;
  void tagWasSought(Tag tag) override;
  void tagMayHaveChanged(const toolkit::Ref<toolkit::View>& view, std::uint32_t element) override;
  void tagsMayBeRestored() override;
  void stateWasSet(const toolkit::Ref<toolkit::View>& view) override;
  void lookMayHaveChanged(const toolkit::Ref<toolkit::View>& view) override;
  std::size_t controlsWithTag(Tag tag) override;
  drivers::ViewKind kindOf(const toolkit::Ref<toolkit::View>& view) const override;

  void build(const std::optional<std::string>& startKey);
  void observe();
  void readRestoredTags();
  Arrival makeAnew(Move move, const Station& from, const PendingTimers& pending,
                   PendingTimers& timers, std::uint8_t* place);
  void goTo(const std::uint8_t* place, std::uint32_t look);
  void remember(const Station& from, const Arrival& arrival, const PendingTimers& timers);
  void restoreLook(std::uint32_t look);
  void press(std::size_t control);
  void touch(Control& control);
  void wait(const PendingTimer& first);
  void noteIfShared(Tag tag);
  void noteIfTimerPressesShared(const std::string& key);
  ViewLook lookOf(const Control& control) const;
  PendingTimers pendingAtTheEnd() const;
  Arrival arrive(Move move, PendingTimers& timers, std::uint8_t* place);
  Arrival abandon(Move move);
  void readTouched(std::uint8_t* place);
  void readEngine();
  void setTag(Control& control, Tag tag);
  /// Returns whether the control has another tag.
  bool updateTag(Control& control, LookValue tagger);
  ControlState stateOf(const Control& control) const;
  Control* controlOf(const toolkit::Ref<toolkit::View>& view);
  std::size_t indexOf(const Control& control) const {
    return static_cast<std::size_t>(&control - controls_.data());
  }

  const Setting& setting_;
  const PlaceFormat& format_;
  Looks& looks_;
  std::unique_ptr<drivers::MemoryDriver> driver_;
  std::unique_ptr<walkthrough::Stage> stage_;
  std::shared_ptr<Recorder> recorder_;
  std::vector<Control> controls_;
  std::unordered_map<const toolkit::View*, std::size_t> indices_;
  std::vector<std::size_t> touched_;
  std::unordered_map<Tag, std::size_t> tagCounts_;
  std::size_t sharedTags_ = 0;  // how many tags two controls or more have
  Trace trace_;                 // of the press
  PressContext context_;
  RememberedPresses presses_;
  const std::vector<Fact>* facts_ = nullptr;
  std::vector<std::uint8_t> place_;  // where the world is
  Looks::Parts parts_;               // of the look that it shows
  bool hasNewTaggers_ = false;
  std::uint32_t look_ = 0;  // the number of that
};

}  // namespace qz::tools::check
