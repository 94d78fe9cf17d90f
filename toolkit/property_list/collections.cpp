#include "toolkit/property_list/collections.hpp"

#include <utility>

#include "toolkit/exception.hpp"
#include "toolkit/property_list/scalars.hpp"

namespace toolkit {
namespace {

bool isKey(const ValueRef<>& value, std::string_view key) {
  return value->kind() == Value::Kind::string && static_cast<const String&>(*value).text() == key;
}

std::string message(const Value& value, std::string_view selector) {
  return "-[" + std::string(value.className()) + " " + std::string(selector) + "]: ";
}

}  // namespace

bool Collection::canChange(std::string_view selector) const {
  if (mutability_ == Mutability::immutable) {
    throw InvalidArgumentException(message(*this, selector) +
                                   "mutating message sent to an immutable object");
  }
  return mutability_ == Mutability::changeable;
}

void Collection::requirePresent(const ValueRef<>& value, std::string_view selector) const {
  if (!value) throw InvalidArgumentException(message(*this, selector) + "the object is absent");
}

void Collection::destroy() noexcept {
  // A collection whose last reference goes while another is being destroyed waits for its turn.
  thread_local bool destroying = false;
  thread_local Collection* waiting = nullptr;
  nextToDestroy_ = waiting;
  waiting = this;
  if (std::exchange(destroying, true)) return;
  while (waiting) delete std::exchange(waiting, waiting->nextToDestroy_);
  destroying = false;
}

Array& Array::nothing() { return nothingAs<Array>(); }

Array::Array(std::vector<ValueRef<>> elements, Mutability mutability)
    : Collection(Kind::array, mutability), elements_(std::move(elements)) {}

ValueRef<Array> Array::make(std::vector<ValueRef<>> elements, Mutability mutability) {
  return Counted<Array>::adopt(new (Trailing{0}) Array(std::move(elements), mutability));
}

std::size_t Array::count() const { return elements_.size(); }

ValueRef<> Array::objectAtIndex(std::size_t index) const {
  if (index < elements_.size()) return elements_[index];
  if (kind() == Kind::nothing) return nullptr;
  const std::string bounds = elements_.empty()
                                 ? "bounds for empty array"
                                 : "bounds [0 .. " + std::to_string(elements_.size() - 1) + "]";
  throw RangeException(message(*this, "objectAtIndex:") + "index " + std::to_string(index) +
                       " beyond " + bounds);
}

void Array::addObject(const ValueRef<>& value) {
  if (!canChange("addObject:")) return;
  requirePresent(value, "addObject:");
  elements_.push_back(value);
}

void Array::removeAllObjects() {
  if (canChange("removeAllObjects")) elements_.clear();
}

Set& Set::nothing() { return nothingAs<Set>(); }

Set::Set(std::vector<ValueRef<>> elements)
    : Collection(Kind::set, Mutability::immutable), elements_(std::move(elements)) {}

ValueRef<Set> Set::make(std::vector<ValueRef<>> elements) {
  return Counted<Set>::adopt(new (Trailing{0}) Set(std::move(elements)));
}

std::size_t Set::count() const { return elements_.size(); }

Dictionary& Dictionary::nothing() { return nothingAs<Dictionary>(); }

Dictionary::Dictionary(std::vector<Entry> entries, Mutability mutability)
    : Collection(Kind::dictionary, mutability), entries_(std::move(entries)) {}

ValueRef<Dictionary> Dictionary::make(std::vector<Entry> entries, Mutability mutability) {
  return Counted<Dictionary>::adopt(new (Trailing{0}) Dictionary(std::move(entries), mutability));
}

std::size_t Dictionary::count() const { return entries_.size(); }

std::size_t Dictionary::position(std::string_view key) const {
  std::size_t at = 0;
  while (at < entries_.size() && !isKey(entries_[at].key, key)) ++at;
  return at;
}

ValueRef<> Dictionary::objectForKey(std::string_view key) const {
  const std::size_t at = position(key);
  return at < entries_.size() ? entries_[at].value : nullptr;
}

std::vector<std::string> Dictionary::allKeys() const {
  std::vector<std::string> keys;
  keys.reserve(entries_.size());
  for (const Entry& entry : entries_) {
    if (const ValueRef<String> key = asString(entry.key)) keys.emplace_back(key->text());
  }
  return keys;
}

ValueRef<Dictionary> Dictionary::copy(Mutability mutability) const {
  return make(entries_, mutability);
}

void Dictionary::setObject(const ValueRef<>& value, std::string_view key) {
  if (!canChange("setObject:forKey:")) return;
  requirePresent(value, "setObject:forKey:");
  const std::size_t at = position(key);
  if (at < entries_.size()) {
    entries_[at].value = value;
  } else {
    entries_.push_back({String::make(key), value});
  }
}

void Dictionary::removeObjectForKey(std::string_view key) {
  if (!canChange("removeObjectForKey:")) return;
  const std::size_t at = position(key);
  if (at < entries_.size()) entries_.erase(entries_.begin() + static_cast<std::ptrdiff_t>(at));
}

void Dictionary::removeAllObjects() {
  if (canChange("removeAllObjects")) entries_.clear();
}

ValueRef<Array> asArray(const ValueRef<>& value) {
  if (value->kind() != Value::Kind::array) return nullptr;
  return Counted<Array>::share(static_cast<Array*>(value.pointer().get()));
}

ValueRef<Dictionary> asDictionary(const ValueRef<>& value) {
  if (value->kind() != Value::Kind::dictionary) return nullptr;
  return Counted<Dictionary>::share(static_cast<Dictionary*>(value.pointer().get()));
}

}  // namespace toolkit
