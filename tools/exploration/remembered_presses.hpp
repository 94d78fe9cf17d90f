// SPDX-License-Identifier: MIT
// What presses did, so that the engine need not do the same again and again: most of the places of
// a large walk-through differ in controls that a press has nothing to do with.
#pragma once

#include <cstddef>
#include <cstdint>
#include <optional>
#include <unordered_map>
#include <vector>

#include "tools/exploration/arrival.hpp"
#include "tools/exploration/facts.hpp"
#include "tools/exploration/looks.hpp"
#include "tools/exploration/place.hpp"

namespace qz::tools::check {

/// Where a move is made, or where it has led.
struct Station {
  const std::uint8_t* place;
  std::uint32_t look;
  const Looks::Parts& parts;  ///< of the look
};

/// What all presses of an exploration have in common.
struct PressContext {
  const PlaceFormat& format;
  /// How many parts of a look are notes of the engine. They follow the controls.
  std::size_t notes;
  /// The tags that an end gives the controls; absent for a control that keeps its tag.
  std::vector<std::optional<Tag>> restoredTags{};

  /// Returns the part of a look that says which element gave the control its tag; absent if looks
  /// do not say that.
  std::optional<std::size_t> taggerPart(const Looks::Parts& parts, std::size_t control) const;
};

/// The controls that a press has looked up, the tags that it has looked for, and the controls to
/// which an element has given another tag. A press depends on nothing else but the engine's notes
/// in the look: it cancels the pending timers first. It changes no other control, but an end gives
/// all controls their own tags back.
class Trace {
 public:
  void clear();
  void addControl(std::size_t control);
  void addTag(Tag tag);
  void addTagged(std::size_t control);
  /// Whether there are so many that finding them again takes as long as the press.
  bool isLong() const { return isLong_; }

  const std::vector<std::size_t>& controls() const { return controls_; }
  const std::vector<Tag>& tags() const { return tags_; }
  const std::vector<std::size_t>& tagged() const { return tagged_; }

 private:
  std::vector<std::size_t> controls_;
  std::vector<Tag> tags_;
  std::vector<std::size_t> tagged_;
  bool isLong_ = false;
};

/// One press, what it depended on and what it did.
class RememberedPress {
 public:
  RememberedPress(const PressContext& context, const Trace& trace, const Station& from,
                  const Station& to);

  /// Whether the same press does the same here.
  bool fits(const PressContext& context, const Station& from) const;
  /// Writes the place to which the press leads.
  void writePlace(const PressContext& context, const Station& from, std::uint8_t* to) const;
  /// Returns the number of the look to which the press leads.
  std::uint32_t lookAfter(const PressContext& context, const Station& from, Looks& looks) const;

  Arrival arrival;
  PendingTimers timers;  ///< that are pending afterwards
  std::vector<Fact> facts;

 private:
  struct Change {
    std::size_t control;
    std::uint32_t before;  // codes
    std::uint32_t after;
  };
  struct LookChange {
    std::size_t part;
    LookValue before;
    LookValue after;
  };
  struct NewTagger {
    std::size_t part;
    LookValue value;
  };
  struct Bearers {
    std::uint32_t tag;  // its number
    std::vector<std::size_t> controls;
  };

  void addLookChange(std::size_t part, const Station& from, const Station& to);

  std::uint32_t look_;  // before
  bool ends_;
  bool changesLook_ = false;
  std::vector<Change> changes_;
  std::vector<LookChange> lookChanges_;
  std::vector<NewTagger> newTaggers_;
  std::vector<Bearers> bearers_;
};

/// The last presses of each control in each of its states.
class RememberedPresses {
 public:
  explicit RememberedPresses(const PressContext& context) : context_(context) {}

  /// Returns null if nothing is remembered that fits.
  const RememberedPress* find(std::size_t control, const Station& from) const;
  void add(std::size_t control, const Station& from, RememberedPress press);

 private:
  /// The control that is pressed, as it is before.
  struct Pressed {
    std::size_t control;
    std::uint32_t code;
    LookValue look;
    friend bool operator==(const Pressed&, const Pressed&) = default;
  };
  struct Hash {
    std::size_t operator()(const Pressed& pressed) const;
  };
  struct Ring {
    std::vector<RememberedPress> presses;
    std::size_t oldest = 0;
  };

  Pressed pressedAt(std::size_t control, const Station& from) const;

  const PressContext& context_;
  std::unordered_map<Pressed, Ring, Hash> rings_;
  std::size_t count_ = 0;
};

}  // namespace qz::tools::check
