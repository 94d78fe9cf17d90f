// SPDX-License-Identifier: MIT
// Views implement only the primitive methods of Foundation's collections; the others call these.

#import "hosts/appkit/table_views.hpp"

#include <string>
#include <utility>
#include <vector>

#import "hosts/appkit/arguments.hpp"
#import "hosts/appkit/engine_timers.hpp"
#include "qz/toolkit/exception.hpp"
#import "toolkit/foundation/collection_views.hpp"
#import "toolkit/foundation/exceptions.hpp"
#import "toolkit/foundation/strings.hpp"

namespace qz::hosts::appkit {

namespace {

using toolkit::foundation::answering;
using toolkit::foundation::nsString;

void requirePresent(id object) {
  if (!object) throw toolkit::InvalidArgumentException("nil cannot be in a collection");
}

/// What a view of a dictionary needs of its table.
class TableAccess {
 public:
  virtual ~TableAccess() = default;
  virtual std::size_t count() const = 0;
  virtual std::vector<std::string> keys() const = 0;
  virtual id object(const std::string& key) const = 0;
  virtual void setObject(id object, const std::string& key) = 0;
  virtual void remove(const std::string& key) = 0;
};

id objectOfEntry(const Engine::Timer& timer, Platform&) { return objectOf(timer); }

Engine::Timer entryOf(id object, Platform&, const Engine::Timer&) { return timerOf(object); }

// A list of the class name, a list of the frame's numbers, and the control.
id objectOfEntry(const AssetRecord& record, Platform& platform) {
  NSMutableArray* const frame = [NSMutableArray array];
  for (const float length : record.frame) [frame addObject:[NSNumber numberWithFloat:length]];
  const id control = platform.object(record.control.get());
  return [NSArray arrayWithObjects:[NSArray arrayWithObject:nsString(record.classNames[0])], frame,
                                   control ? control : [NSNull null], nil];
}

NSArray* listAt(NSArray* list, NSUInteger index, NSUInteger count) {
  NSArray* const element = [list objectAtIndex:index];
  requireKind(element, [NSArray class]);
  if ([element count] == count) return element;
  throw toolkit::InvalidArgumentException(
      "a record of a control is a list of its class name, a list of x, y, width and height, and "
      "the control");
}

AssetRecord entryOf(id object, Platform& platform, const AssetRecord&) {
  NSArray* const record = listAt([NSArray arrayWithObject:object], 0, 3);
  NSArray* const frame = listAt(record, 1, 4);
  AssetRecord entry;
  entry.classNames[0] = textOf([listAt(record, 0, 1) objectAtIndex:0]).value_or("");
  for (NSUInteger i = 0; i < 4; ++i) {
    requireKind([frame objectAtIndex:i], [NSNumber class]);
    entry.frame[i] = [[frame objectAtIndex:i] floatValue];
  }
  const id control = [record objectAtIndex:2];
  entry.control = toolkit::StoredRef<toolkit::View>::refer(
      control == [NSNull null] ? toolkit::Ref<toolkit::View>() : platform.view(control));
  return entry;
}

template <class Entry>
class AccessTo final : public TableAccess {
 public:
  using Table = toolkit::Ref<toolkit::Table<Entry>>;

  AccessTo(Table table, Platform& platform) : table_(std::move(table)), platform_(platform) {}
  const Table& table() const { return table_; }

  std::size_t count() const override { return table_->count(); }
  std::vector<std::string> keys() const override {
    std::vector<std::string> keys;
    for (const auto& [key, entry] : table_->entries()) keys.push_back(key);
    return keys;
  }
  id object(const std::string& key) const override {
    return table_->contains(key) ? objectOfEntry(table_->objectForKey(key), platform_) : nil;
  }
  void setObject(id object, const std::string& key) override {
    requirePresent(object);
    table_->setObject(entryOf(object, platform_, Entry()), key);
  }
  void remove(const std::string& key) override { table_->removeObjectForKey(key); }

 private:
  Table table_;
  Platform& platform_;
};

// The controls of a list, which cannot be changed except at its end.
struct ControlList {
  Engine::Controls controls;
  Platform& platform;

  id objectAt(NSUInteger index) const {
    const auto& elements = controls->elements();
    if (index < elements.size()) return platform.object(elements[index]);
    throw toolkit::RangeException("the index " + std::to_string(index) +
                                  " is beyond the end of a list of " +
                                  std::to_string(elements.size()));
  }

  template <class Change>
  void change(const Change& change) const {
    auto elements = controls->elements();
    change(elements);
    controls->removeAllObjects();
    for (auto& element : elements) controls->addObject(std::move(element));
  }
};

}  // namespace

}  // namespace qz::hosts::appkit

namespace face = qz::hosts::appkit;
using qz::toolkit::foundation::answering;

/// Shows a table with string keys.
@interface QZTableView : QZKeyedView {
 @private
  face::TableAccess* access_;  // owned
}
- (id)initWithAccess:(face::TableAccess*)access;
- (face::TableAccess*)access;
@end

@implementation QZTableView

// Does not call the initialiser of the abstract class, which raises in a subclass.
- (id)initWithAccess:(face::TableAccess*)access {
  access_ = access;
  return self;
}

- (void)dealloc {
  delete access_;
  [super dealloc];
}

- (face::TableAccess*)access {
  return access_;
}

- (NSUInteger)count {
  return access_->count();
}

- (id)objectForKey:(id)key {
  const auto* access = access_;
  if (![key isKindOfClass:[NSString class]]) return nil;
  return answering([&] { return access->object(qz::toolkit::foundation::utf8(key)); });
}

- (NSEnumerator*)keyEnumerator {
  NSMutableArray* const keys = [NSMutableArray array];
  for (const std::string& key : access_->keys()) [keys addObject:face::nsString(key)];
  return [keys objectEnumerator];
}

- (void)setObject:(id)object forKey:(id)key {
  auto* access = access_;
  answering([&] {
    face::requireKind(key, [NSString class]);
    access->setObject(object, qz::toolkit::foundation::utf8(key));
  });
}

- (void)removeObjectForKey:(id)key {
  auto* access = access_;
  answering([&] {
    face::requireKind(key, [NSString class]);
    access->remove(qz::toolkit::foundation::utf8(key));
  });
}

@end

/// Shows a list of controls.
@interface QZControlsView : NSMutableArray {
 @private
  face::ControlList* list_;  // owned
}
- (id)initWithList:(const face::ControlList&)list;
- (face::ControlList*)list;
@end

@implementation QZControlsView

- (id)initWithList:(const face::ControlList&)list {
  list_ = new face::ControlList(list);
  return self;
}

- (void)dealloc {
  delete list_;
  [super dealloc];
}

- (face::ControlList*)list {
  return list_;
}

- (NSUInteger)count {
  return list_->controls->count();
}

- (id)objectAtIndex:(NSUInteger)index {
  const auto* list = list_;
  return answering([&] { return list->objectAt(index); });
}

- (void)addObject:(id)object {
  [self insertObject:object atIndex:[self count]];
}

- (void)removeLastObject {
  [self removeObjectAtIndex:[self count] - 1];
}

- (void)insertObject:(id)object atIndex:(NSUInteger)index {
  const auto* list = list_;
  answering([&] {
    face::requirePresent(object);
    if (index > list->controls->count()) list->objectAt(index);  // raises
    const auto control = list->platform.view(object);
    list->change([&](auto& elements) {
      elements.insert(elements.begin() + static_cast<std::ptrdiff_t>(index), control);
    });
  });
}

- (void)removeObjectAtIndex:(NSUInteger)index {
  const auto* list = list_;
  answering([&] {
    list->objectAt(index);  // raises if there is none
    list->change([&](auto& elements) {
      elements.erase(elements.begin() + static_cast<std::ptrdiff_t>(index));
    });
  });
}

- (void)replaceObjectAtIndex:(NSUInteger)index withObject:(id)object {
  [self insertObject:object atIndex:index];
  [self removeObjectAtIndex:index + 1];
}

@end

namespace qz::hosts::appkit {

namespace {

template <class Entry>
NSMutableDictionary* viewOfTable(const toolkit::Ref<toolkit::Table<Entry>>& table,
                                 Platform& platform) {
  return [[[QZTableView alloc] initWithAccess:new AccessTo<Entry>(table, platform)] autorelease];
}

template <class Entry>
bool getTableOf(id object, toolkit::Ref<toolkit::Table<Entry>>& table) {
  if (![object isKindOfClass:[QZTableView class]]) return false;
  const auto* const access = dynamic_cast<const AccessTo<Entry>*>([object access]);
  if (access) table = access->table();
  return access != nullptr;
}

}  // namespace

NSMutableArray* viewOf(const Engine::Controls& controls, Platform& platform) {
  return [[[QZControlsView alloc] initWithList:ControlList{controls, platform}] autorelease];
}

NSMutableDictionary* viewOf(const Engine::GuiAssets& records, Platform& platform) {
  return viewOfTable(records, platform);
}

NSMutableDictionary* viewOf(const Engine::Timers& timers, Platform& platform) {
  return viewOfTable(timers, platform);
}

bool getTable(id object, Engine::Controls& table) {
  if (![object isKindOfClass:[QZControlsView class]]) return false;
  table = [object list]->controls;
  return true;
}

bool getTable(id object, Engine::GuiAssets& table) { return getTableOf(object, table); }
bool getTable(id object, Engine::Timers& table) { return getTableOf(object, table); }

void copyElements(id collection, id other) {
  if ([collection isKindOfClass:[NSMutableArray class]]) {
    requireKind(other, [NSArray class]);
    [collection setArray:other];
  } else if ([collection isKindOfClass:[NSMutableDictionary class]]) {
    requireKind(other, [NSDictionary class]);
    [collection setDictionary:other];
  }
}

}  // namespace qz::hosts::appkit
