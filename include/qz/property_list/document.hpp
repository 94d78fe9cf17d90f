// SPDX-License-Identifier: MIT
// The memory shared by all values read from one file.
//
// Invariants: the values in a document are freed together and refer to no value outside it. A
// reference to any of them counts on the document. References between them are not counted, and
// their destructors never run.
#pragma once

#include <algorithm>
#include <atomic>
#include <cstddef>
#include <cstdint>
#include <memory_resource>

#include "qz/api.hpp"

namespace qz::toolkit {

/// Owns the values of one file, in blocks of memory that are released together.
class QZ_API Document final : public std::pmr::memory_resource {
 public:
  /// The alignment of values, in bytes, and the unit of distances within a block.
  static constexpr std::size_t unit = 8;

  /// Memory that starts with a pointer to its document, so that a value can find its document by
  /// its distance from the start.
  struct Block {
    Document* document;  ///< whose block it is
    Block* previous;     ///< null for the first
  };

  /// Memory for a value, and its distance in units from the start of its block.
  struct Place {
    void* memory;            ///< where the value is made
    std::uint32_t distance;  ///< in units
  };

  Document(const Document&) = delete;
  Document& operator=(const Document&) = delete;

  /// Makes an empty document with one count, which the caller owns.
  static Document* make() { return new Document; }
  /// Adds an owner.
  void retain() { count_.fetch_add(1, std::memory_order_relaxed); }
  /// Removes an owner; the last one destroys the document.
  void release() {
    if (count_.fetch_sub(1, std::memory_order_acq_rel) == 1) delete this;
  }

  /// Returns memory for a value of `bytes` bytes.
  Place place(std::size_t bytes) {
    bytes = (bytes + unit - 1) & ~(unit - 1);
    if (bytes > static_cast<std::size_t>(end_ - next_)) return placeInNewBlock(bytes);
    const Place place{next_, static_cast<std::uint32_t>((next_ - start()) / std::ptrdiff_t{unit})};
    next_ += bytes;
    return place;
  }

 private:
  Document() = default;
  ~Document() override;
  std::byte* start() { return reinterpret_cast<std::byte*>(current_); }
  Block* addBlock(std::size_t bytes, Block*& previous);
  Place placeInNewBlock(std::size_t bytes);

  void* do_allocate(std::size_t bytes, std::size_t alignment) override;
  void do_deallocate(void*, std::size_t, std::size_t) override {}
  bool do_is_equal(const memory_resource& other) const noexcept override { return this == &other; }

  std::atomic<std::size_t> count_{1};
  Block* current_ = nullptr;  // the block that is being filled; links to the earlier ones
  std::byte* next_ = nullptr;
  std::byte* end_ = nullptr;
  std::size_t total_ = 0;  // bytes in all blocks
};

}  // namespace qz::toolkit
