// SPDX-License-Identifier: MIT
// The engine's tables of controls, records and timers as collections of Foundation. Both sides see
// each other's changes.
#pragma once

#import <Foundation/Foundation.h>

#include "hosts/appkit/platform.hpp"
#include "qz/engine.hpp"
#import "toolkit/foundation/kept.hpp"

namespace qz::hosts::appkit {

using Engine = qz::QZ_Plist_State_Parser;

/// Return a new view of a table, autoreleased.
NSMutableArray* viewOf(const Engine::Controls& controls, Platform& platform);
NSMutableDictionary* viewOf(const Engine::GuiAssets& records, Platform& platform);
NSMutableDictionary* viewOf(const Engine::Timers& timers, Platform& platform);

/// Set `table` to the table of a view; return false for any other object.
bool getTable(id object, Engine::Controls& table);
bool getTable(id object, Engine::GuiAssets& table);
bool getTable(id object, Engine::Timers& table);

/// Makes `collection`, which is mutable, equal to `other`; raises if their classes differ.
void copyElements(id collection, id other);

/// A table of the engine and the object that the host has for it: a view, or the host's own
/// collection, whose elements are then copied to and fro.
template <class Table>
class TableTwin {
 public:
  /// Returns the object of the engine's table, autoreleased; always the same for the same table.
  id objectFor(const Table& table, Platform& platform) {
    if (!table) return nil;
    if (!(table == table_)) show(table, Kept(viewOf(table, platform)), {});
    push();
    return [[(own_ ? own_ : view_).get() retain] autorelease];
  }

  /// Returns the table for the host's object.
  Table tableFor(id object, Platform& platform) {
    if (!object) return {};
    Table table;
    if (getTable(object, table)) {
      show(table, Kept(object), {});
    } else if (object != own_.get()) {
      table = Made::make();
      const Kept view(viewOf(table, platform));
      copyElements(view.get(), object);
      show(table, view, Kept(object));
    }
    pull();
    return table_;
  }

  /// Copies changes of the host's own collection to the table.
  void pull() {
    if (own_ && ![own_.get() isEqual:view_.get()]) copyElements(view_.get(), own_.get());
  }
  /// Copies changes of the table to the host's own collection, if that is mutable.
  void push() {
    if (own_ && ![own_.get() isEqual:view_.get()]) copyElements(own_.get(), view_.get());
  }

 private:
  using Kept = toolkit::foundation::Kept<id>;
  using Made = std::remove_reference_t<decltype(*std::declval<Table>())>;

  void show(const Table& table, Kept view, Kept own) {
    table_ = table;
    view_ = std::move(view);
    own_ = std::move(own);
  }

  Table table_;
  Kept view_;
  Kept own_;  // nil if the host has the view
};

}  // namespace qz::hosts::appkit
