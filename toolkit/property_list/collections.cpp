// SPDX-License-Identifier: MIT
#include "qz/property_list/collections.hpp"

#include <utility>

#include "qz/property_list/scalars.hpp"
#include "qz/toolkit/exception.hpp"

namespace qz::toolkit {
namespace {

bool isText(const Value& key, std::string_view text) {
  return key.kind() == Value::Kind::string && static_cast<const String&>(key).text() == text;
}

/// Returns a reference from one value of a document to another. Does not count, because the
/// reference is never released.
ValueRef<> uncounted(Value* value) { return Counted<Value>::adopt(value); }

std::span<const ValueRef<>> uncounted(std::span<Value* const> values, Document& document) {
  auto* const references =
      static_cast<ValueRef<>*>(document.allocate(values.size_bytes(), alignof(ValueRef<>)));
  auto* next = references;
  for (Value* value : values) std::construct_at(next++, uncounted(value));
  return {references, values.size()};
}

std::string message(const Value& value, std::string_view selector) {
  return "-[" + std::string(value.className()) + " " + std::string(selector) + "]: ";
}

}  // namespace

bool Collection::refuseChange(std::string_view selector) const {
  if (mutability_ == Mutability::ignored) return false;
  throw InvalidArgumentException(message(*this, selector) +
                                 "mutating message sent to an immutable object");
}

void Collection::requirePresent(const ValueRef<>& value, std::string_view selector) const {
  if (!value) throw InvalidArgumentException(message(*this, selector) + "the object is absent");
}

void Collection::destroy() noexcept {
  // A collection that loses its last reference while another is being destroyed waits its turn, so
  // that nesting uses no stack.
  thread_local bool destroying = false;
  thread_local Collection* waiting = nullptr;
  nextToDestroy_ = waiting;
  waiting = this;
  if (std::exchange(destroying, true)) return;
  while (waiting) delete std::exchange(waiting, waiting->nextToDestroy_);
  destroying = false;
}

Array& Array::nothing() { return nothingAs<Array>(); }

Array::Array(std::vector<ValueRef<>>&& elements, Mutability mutability)
    : Collection(Kind::array, mutability),
      own_(std::make_unique<std::vector<ValueRef<>>>(std::move(elements))) {
  elements_ = *own_;
}

Array::Array(std::span<Value* const> elements, Document* document)
    : Collection(Kind::array, Mutability::immutable), elements_(uncounted(elements, *document)) {}

ValueRef<Array> Array::make(std::vector<ValueRef<>> elements, Mutability mutability) {
  return makeAlone<Array>(0, std::move(elements), mutability);
}

Array* Array::make(Document& document, std::span<Value* const> elements) {
  return makeIn<Array>(document, 0, elements, &document);
}

const ValueRef<>& Array::objectBeyondEnd(std::size_t index) const {
  if (kind() == Kind::nothing) return Value::objectAtIndex(index);
  const std::string bounds = elements_.empty()
                                 ? "bounds for empty array"
                                 : "bounds [0 .. " + std::to_string(elements_.size() - 1) + "]";
  throw RangeException(message(*this, "objectAtIndex:") + "index " + std::to_string(index) +
                       " beyond " + bounds);
}

void Array::addObject(const ValueRef<>& value) {
  if (!canChange("addObject:")) return;
  requirePresent(value, "addObject:");
  if (elements_.data() != own_->data()) own_->assign(elements_.begin(), elements_.end());
  own_->push_back(value);
  elements_ = *own_;
}

void Array::removeAllObjects() {
  if (!canChange("removeAllObjects")) return;
  own_->clear();
  elements_ = {};
}

void Array::setElements(std::span<const ValueRef<>> elements) {
  if (!canChange("setArray:")) return;
  own_->assign(elements.begin(), elements.end());
  elements_ = *own_;
}

Set& Set::nothing() { return nothingAs<Set>(); }

Set::Set(std::vector<ValueRef<>>&& elements)
    : Collection(Kind::set, Mutability::immutable), own_(std::move(elements)) {
  elements_ = own_;
}

Set::Set(std::span<Value* const> elements, Document* document)
    : Collection(Kind::set, Mutability::immutable), elements_(uncounted(elements, *document)) {}

ValueRef<Set> Set::make(std::vector<ValueRef<>> elements) {
  return makeAlone<Set>(0, std::move(elements));
}

Set* Set::make(Document& document, std::span<Value* const> elements) {
  return makeIn<Set>(document, 0, elements, &document);
}

std::size_t Set::count() const { return elements_.size(); }

Dictionary& Dictionary::nothing() { return nothingAs<Dictionary>(); }

Dictionary::Dictionary(std::span<Entry> entries, Mutability mutability)
    : Collection(Kind::dictionary, mutability) {
  entries_.reserve(entries.size());
  for (Entry& entry : entries) {
    const std::uint64_t hash = hashOfKey(*entry.key);
    const std::size_t at = positionOf(*entry.key, hash);
    if (at == KeyIndex::none) {
      append(std::move(entry), hash);
    } else {
      entries_[at].value = std::move(entry.value);
    }
  }
}

Dictionary::Dictionary(std::span<Value* const> keysAndValues,
                       std::span<const std::uint64_t> laterHashes, Duplicates duplicates,
                       Document* document)
    : Collection(Kind::dictionary, Mutability::immutable), entries_(document) {
  // All memory is allocated before the first reference exists, because no destructor may run on an
  // uncounted reference.
  const std::size_t count = keysAndValues.size() / 2;
  entries_.reserve(count);
  if (count > mostWithoutIndex) {
    index_.reset(new (document->place(sizeof(KeyIndex)).memory) KeyIndex(count, document));
  }
  for (std::size_t i = 0; i < count; ++i) {
    Value* key = keysAndValues[2 * i];
    Value* value = keysAndValues[2 * i + 1];
    const std::uint64_t hash = i >= mostWithoutIndex ? laterHashes[i - mostWithoutIndex]
                               : index_              ? hashOfKey(*key)
                                                     : 0;
    const std::size_t at = positionOf(*key, hash);
    if (at == KeyIndex::none) {
      append({uncounted(key), uncounted(value)}, hash);
    } else if (duplicates == Duplicates::lastWins) {
      // Not assigned: an assignment would release the earlier value, which was never counted.
      std::construct_at(&entries_[at].value, uncounted(value));
    }
  }
}

Dictionary::Dictionary(const Dictionary& other, Mutability mutability)
    : Collection(Kind::dictionary, mutability),
      entries_(other.entries_, std::pmr::new_delete_resource()) {
  if (other.index_) {
    index_ = std::make_unique<KeyIndex>(*other.index_, std::pmr::new_delete_resource());
  }
}

ValueRef<Dictionary> Dictionary::make(std::vector<Entry> entries, Mutability mutability) {
  return makeAlone<Dictionary>(0, std::span(entries), mutability);
}

Dictionary* Dictionary::make(Document& document, std::span<Value* const> keysAndValues,
                             std::span<const std::uint64_t> laterHashes, Duplicates duplicates) {
  return makeIn<Dictionary>(document, 0, keysAndValues, laterHashes, duplicates, &document);
}

ValueRef<Dictionary> Dictionary::copy(Mutability mutability) const {
  return makeAlone<Dictionary>(0, *this, mutability);
}

std::size_t Dictionary::count() const { return entries_.size(); }

/// `hash` is used only if there is an index.
template <class IsKey>
std::size_t Dictionary::positionWhere(std::uint64_t hash, IsKey isKey) const {
  const auto isKeyAt = [&](std::size_t at) { return isKey(*entries_[at].key); };
  if (index_) return index_->find(hash, isKeyAt);
  for (std::size_t at = 0; at < entries_.size(); ++at) {
    if (isKeyAt(at)) return at;
  }
  return KeyIndex::none;
}

std::size_t Dictionary::positionOf(std::string_view key, std::uint64_t hash) const {
  return positionWhere(hash, [&](const Value& other) { return isText(other, key); });
}

std::size_t Dictionary::positionOf(const Value& key, std::uint64_t hash) const {
  return positionWhere(hash, [&](const Value& other) { return sameKey(other, key); });
}

void Dictionary::append(Entry&& entry, std::uint64_t hash) {
  const bool hadIndex = index_ != nullptr;
  if (hadIndex ? index_->isFull() : entries_.size() == mostWithoutIndex) growIndex();
  entries_.push_back(std::move(entry));
  if (index_) index_->append(hadIndex ? hash : hashOfKey(*entries_.back().key));
}

void Dictionary::growIndex() {
  auto larger = std::make_unique<KeyIndex>(2 * entries_.size(), std::pmr::new_delete_resource());
  for (const Entry& entry : entries_) larger->append(hashOfKey(*entry.key));
  index_ = std::move(larger);
}

ValueRef<> Dictionary::objectForKey(std::string_view key) const {
  const std::size_t at = positionOf(key, hashFor(key));
  return at == KeyIndex::none ? nullptr : entries_[at].value;
}

std::vector<std::string> Dictionary::allKeys() const {
  std::vector<std::string> keys;
  keys.reserve(entries_.size());
  for (const Entry& entry : entries_) {
    if (const ValueRef<String> key = asString(entry.key)) keys.emplace_back(key->text());
  }
  return keys;
}

void Dictionary::setObject(const ValueRef<>& value, std::string_view key) {
  if (!canChange("setObject:forKey:")) return;
  requirePresent(value, "setObject:forKey:");
  const std::uint64_t hash = hashFor(key);
  const std::size_t at = positionOf(key, hash);
  if (at == KeyIndex::none) {
    append({String::make(key), value}, hash);
  } else {
    entries_[at].value = value;
  }
}

void Dictionary::removeObjectForKey(std::string_view key) {
  if (!canChange("removeObjectForKey:")) return;
  const std::size_t at = positionOf(key, hashFor(key));
  if (at == KeyIndex::none) return;
  if (index_) {
    index_->remove(at, [&](std::size_t position) { return hashOfKey(*entries_[position].key); });
  }
  entries_.erase(entries_.begin() + static_cast<std::ptrdiff_t>(at));
}

void Dictionary::removeAllObjects() {
  if (!canChange("removeAllObjects")) return;
  entries_.clear();
  index_.reset();
}

ValueRef<Array> asArray(const ValueRef<>& value) {
  if (value->kind() != Value::Kind::array) return nullptr;
  return Counted<Array>::share(static_cast<Array*>(value.pointer().get()));
}

ValueRef<Dictionary> asDictionary(const ValueRef<>& value) {
  if (value->kind() != Value::Kind::dictionary) return nullptr;
  return Counted<Dictionary>::share(static_cast<Dictionary*>(value.pointer().get()));
}

}  // namespace qz::toolkit
