// SPDX-License-Identifier: MIT
// Views implement only the primitive methods of Foundation's collections; the others call these.
// The table of the views does not retain them. Every release of a view holds the table's lock, so
// that no other thread finds a view that is being deallocated.

#import "toolkit/foundation/collection_views.hpp"

#include <algorithm>
#include <mutex>
#include <string>
#include <unordered_map>
#include <vector>

#include "qz/toolkit/exception.hpp"
#import "toolkit/foundation/exceptions.hpp"
#import "toolkit/foundation/strings.hpp"
#import "toolkit/foundation/values.hpp"

namespace qz::toolkit::foundation {

namespace {

struct Views {
  std::recursive_mutex mutex;
  std::unordered_map<const Value*, id> byValue;
};

// Never destroyed: views may be released while the program exits.
Views& views() {
  static auto& table = *new Views;
  return table;
}

using Lock = std::lock_guard<std::recursive_mutex>;

void forget(const Value* value) {
  const Lock lock(views().mutex);
  views().byValue.erase(value);
}

template <class Make>
id knownOr(const Value& value, Make make) {
  const Lock lock(views().mutex);
  id& view = views().byValue[&value];
  return view ? [[view retain] autorelease] : [(view = make()) autorelease];
}

ValueRef<Array> shared(Array* array) { return Counted<Array>::share(array); }
ValueRef<Dictionary> shared(Dictionary* dictionary) {
  return Counted<Dictionary>::share(dictionary);
}

// Changes a copy of the elements, and makes it the contents of the array.
template <class Change>
void changeElements(Array* array, Change change) {
  answering([&] {
    const auto kept = shared(array);
    std::vector<ValueRef<>> elements(kept->elements().begin(), kept->elements().end());
    change(elements);
    kept->setElements(elements);
  });
}

// Functions, because GCC cannot compile a lambda that uses a field of an Objective-C object.
id elementOf(Array* array, NSUInteger index) {
  return answering([&] { return objectOf(array->objectAtIndex(index)); });
}

void append(id object, Array* array) {
  answering([&] { shared(array)->addObject(valueOf(object)); });
}

std::ptrdiff_t checkedOffset(NSUInteger index, std::size_t count) {
  if (index >= count) {
    throw RangeException("the index " + std::to_string(index) +
                         " is beyond the end of an array of " + std::to_string(count));
  }
  return static_cast<std::ptrdiff_t>(index);
}

ValueRef<> presentValueOf(id object) {
  ValueRef<> value = valueOf(object);
  if (!value) throw InvalidArgumentException("nil cannot be in a collection");
  return value;
}

std::string textOfKey(id key) {
  if (![key isKindOfClass:[NSString class]]) {
    throw InvalidArgumentException("a dictionary of a script has strings as keys, got " +
                                   (key ? utf8(NSStringFromClass([key class])) : "nil"));
  }
  return utf8(key);
}

// Finds also the keys of binary property lists that are not strings.
ValueRef<> lookUp(const Dictionary& dictionary, id key) {
  if ([key isKindOfClass:[NSString class]]) return dictionary.objectForKey(utf8(key));
  const auto entries = dictionary.entries();
  const auto found = std::find_if(entries.begin(), entries.end(), [&](const auto& entry) {
    return [objectOf(entry.key) isEqual:key];
  });
  return found == entries.end() ? ValueRef<>() : found->value;
}

id objectUnder(id key, Dictionary* dictionary) {
  return answering([&] { return objectOf(lookUp(*dictionary, key)); });
}

void store(id object, id key, Dictionary* dictionary) {
  answering([&] { shared(dictionary)->setObject(valueOf(object), textOfKey(key)); });
}

void removeKey(id key, Dictionary* dictionary) {
  answering([&] { shared(dictionary)->removeObjectForKey(textOfKey(key)); });
}

NSArray* keysOf(const Dictionary& dictionary) {
  NSMutableArray* const keys = [NSMutableArray arrayWithCapacity:dictionary.count()];
  for (const auto& entry : dictionary.entries()) [keys addObject:objectOf(entry.key)];
  return keys;
}

}  // namespace

QZArrayView* viewOf(Array& array) {
  return knownOr(array, [&] { return [[QZArrayView alloc] initWithArrayValue:&array]; });
}

QZDictionaryView* viewOf(Dictionary& dictionary) {
  return knownOr(dictionary,
                 [&] { return [[QZDictionaryView alloc] initWithDictionaryValue:&dictionary]; });
}

}  // namespace qz::toolkit::foundation

using namespace qz::toolkit;
using namespace qz::toolkit::foundation;

@implementation QZArrayView

// Does not call the initialiser of the abstract class, which raises in a subclass.
- (id)initWithArrayValue:(Array*)array {
  array_ = array;
  array_->retain();
  return self;
}

- (oneway void)release {
  const Lock lock(views().mutex);
  [super release];
}

- (void)dealloc {
  forget(array_);
  array_->release();
  [super dealloc];
}

- (Array*)arrayValue {
  return array_;
}

- (NSUInteger)count {
  return array_->count();
}

- (id)objectAtIndex:(NSUInteger)index {
  return elementOf(array_, index);
}

- (void)addObject:(id)object {
  append(object, array_);
}

- (void)insertObject:(id)object atIndex:(NSUInteger)index {
  changeElements(array_, [&](auto& elements) {
    elements.insert(elements.begin() + checkedOffset(index, elements.size() + 1),
                    presentValueOf(object));
  });
}

- (void)removeLastObject {
  [self removeObjectAtIndex:[self count] - 1];
}

- (void)removeObjectAtIndex:(NSUInteger)index {
  changeElements(array_, [&](auto& elements) {
    elements.erase(elements.begin() + checkedOffset(index, elements.size()));
  });
}

- (void)replaceObjectAtIndex:(NSUInteger)index withObject:(id)object {
  changeElements(array_, [&](auto& elements) {
    elements[static_cast<std::size_t>(checkedOffset(index, elements.size()))] =
        presentValueOf(object);
  });
}

@end

@implementation QZKeyedView

// GNUstep does not derive it from the other methods.
- (NSEnumerator*)objectEnumerator {
  return [[self objectsForKeys:[self allKeys] notFoundMarker:[NSNull null]] objectEnumerator];
}

@end

@implementation QZDictionaryView

- (id)initWithDictionaryValue:(Dictionary*)dictionary {
  dictionary_ = dictionary;
  dictionary_->retain();
  return self;
}

- (oneway void)release {
  const Lock lock(views().mutex);
  [super release];
}

- (void)dealloc {
  forget(dictionary_);
  dictionary_->release();
  [super dealloc];
}

- (Dictionary*)dictionaryValue {
  return dictionary_;
}

- (NSUInteger)count {
  return dictionary_->count();
}

- (id)objectForKey:(id)key {
  return objectUnder(key, dictionary_);
}

- (NSEnumerator*)keyEnumerator {
  return [keysOf(*dictionary_) objectEnumerator];
}

- (void)setObject:(id)object forKey:(id)key {
  store(object, key, dictionary_);
}

- (void)removeObjectForKey:(id)key {
  removeKey(key, dictionary_);
}

@end
