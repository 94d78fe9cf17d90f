// SPDX-License-Identifier: MIT
#include "qz/property_list/key_index.hpp"

#include <bit>
#include <cmath>
#include <cstring>
#include <random>
#include <stdexcept>

#include "qz/property_list/scalars.hpp"

namespace qz::toolkit {
namespace {

/// SipHash-1-3: fast for short keys, and an attacker without the key cannot make keys collide.
class SipHash {
 public:
  SipHash() {
    std::random_device random;
    const auto word = [&] { return (std::uint64_t{random()} << 32) | random(); };
    key0_ = word();
    key1_ = word();
  }

  std::uint64_t operator()(std::string_view text) const {
    State state{key0_ ^ 0x736F6D6570736575, key1_ ^ 0x646F72616E646F6D, key0_ ^ 0x6C7967656E657261,
                key1_ ^ 0x7465646279746573};
    const std::size_t whole = text.size() & ~std::size_t{7};
    for (std::size_t at = 0; at < whole; at += 8) state.absorb(load(text.substr(at, 8)));
    state.absorb(load(text.substr(whole)) | (std::uint64_t{text.size()} << 56));
    state.v2 ^= 0xFF;
    for (int i = 0; i < 3; ++i) state.round();
    return state.v0 ^ state.v1 ^ state.v2 ^ state.v3;
  }

 private:
  struct State {
    std::uint64_t v0, v1, v2, v3;

    void absorb(std::uint64_t word) {
      v3 ^= word;
      round();
      v0 ^= word;
    }

    void round() {
      v0 += v1;
      v1 = std::rotl(v1, 13) ^ v0;
      v0 = std::rotl(v0, 32);
      v2 += v3;
      v3 = std::rotl(v3, 16) ^ v2;
      v0 += v3;
      v3 = std::rotl(v3, 21) ^ v0;
      v2 += v1;
      v1 = std::rotl(v1, 17) ^ v2;
      v2 = std::rotl(v2, 32);
    }
  };

  static std::uint64_t load(std::string_view bytes) {
    std::uint64_t word = 0;
    if (!bytes.empty()) std::memcpy(&word, bytes.data(), bytes.size());
    return word;
  }

  std::uint64_t key0_;
  std::uint64_t key1_;
};

template <class Bits>
std::uint64_t hashOfBits(const Bits& bits) {
  return hashOf({reinterpret_cast<const char*>(&bits), sizeof bits});
}

bool isBoolean(const Number& number) { return number.type() == Number::Type::boolean; }

/// Whether a real is an integer that fits in 64 bits, signed or unsigned.
bool isInteger(double real) { return real >= -0x1p63 && real < 0x1p64 && real == std::trunc(real); }

std::uint64_t bitsOfInteger(double real) {
  return real < 0 ? static_cast<std::uint64_t>(static_cast<std::int64_t>(real))
                  : static_cast<std::uint64_t>(real);
}

/// Returns the same hash for equal numbers, whatever their types.
std::uint64_t hashOfNumber(const Number& number) {
  if (!number.isReal()) return hashOfBits(number.bits());
  const double real = number.doubleValue();
  if (isInteger(real)) return hashOfBits(bitsOfInteger(real));
  return std::isnan(real) ? 0 : hashOfBits(real);
}

bool isNegative(const Number& integer) {
  return integer.type() == Number::Type::signedInteger && integer.integerValue() < 0;
}

bool sameInteger(const Number& integer, double real) {
  // Compared as integers: beyond 2^53 a double cannot represent every integer.
  return isInteger(real) && isNegative(integer) == (real < 0) &&
         integer.bits() == bitsOfInteger(real);
}

bool sameNumber(const Number& a, const Number& b) {
  if (isBoolean(a) != isBoolean(b)) return false;
  if (a.isReal() && b.isReal()) {
    return a.doubleValue() == b.doubleValue() ||
           (std::isnan(a.doubleValue()) && std::isnan(b.doubleValue()));
  }
  if (a.isReal()) return sameInteger(b, a.doubleValue());
  if (b.isReal()) return sameInteger(a, b.doubleValue());
  return a.bits() == b.bits() && isNegative(a) == isNegative(b);
}

}  // namespace

std::uint64_t hashOf(std::string_view text) {
  static const SipHash hash;
  return hash(text);
}

std::uint64_t hashOfKey(const Value& key) {
  switch (key.kind()) {
    case Value::Kind::string:
      return hashOf(static_cast<const String&>(key).text());
    case Value::Kind::data:
      return hashOf(static_cast<const Data&>(key).bytes());
    case Value::Kind::number:
      return hashOfNumber(static_cast<const Number&>(key));
    case Value::Kind::uid:
      return hashOfBits(static_cast<const Uid&>(key).number());
    case Value::Kind::date: {
      const double seconds = static_cast<const Date&>(key).secondsSinceReferenceDate();
      return hashOfBits(seconds == 0 ? 0 : seconds);  // both zeros are the same moment
    }
    default:
      return 0;
  }
}

bool sameKey(const Value& a, const Value& b) {
  if (&a == &b) return true;
  if (a.kind() != b.kind()) return false;
  switch (a.kind()) {
    case Value::Kind::string:
      return static_cast<const String&>(a).text() == static_cast<const String&>(b).text();
    case Value::Kind::data:
      return static_cast<const Data&>(a).bytes() == static_cast<const Data&>(b).bytes();
    case Value::Kind::number:
      return sameNumber(static_cast<const Number&>(a), static_cast<const Number&>(b));
    case Value::Kind::uid:
      return static_cast<const Uid&>(a).number() == static_cast<const Uid&>(b).number();
    case Value::Kind::date:
      return static_cast<const Date&>(a).secondsSinceReferenceDate() ==
             static_cast<const Date&>(b).secondsSinceReferenceDate();
    case Value::Kind::null:
      return true;
    default:
      return false;
  }
}

KeyIndex::KeyIndex(std::size_t count, std::pmr::memory_resource* memory)
    : slots_(std::bit_ceil(count + count / 3 + 4), memory) {
  if (count >= free) throw std::length_error("too many keys in a dictionary");
}

void KeyIndex::append(std::uint64_t hash) {
  std::size_t at = home(hash);
  while (slots_[at].position != free) at = next(at);
  slots_[at] = {static_cast<Position>(used_++), tagOf(hash)};
}

}  // namespace qz::toolkit
