// SPDX-License-Identifier: MIT
#include "qz/property_list/document.hpp"

#include <cassert>
#include <new>

namespace qz::toolkit {
namespace {

// Blocks grow with the document, so that small files waste no memory and large ones need few
// allocations. A new block is an eighth of the present size, which limits the unused rest at the
// end.
constexpr std::size_t smallestBlock = 2048;
constexpr std::size_t largestBlock = 1U << 20;

}  // namespace

Document::~Document() {
  while (current_) {
    Block* previous = current_->previous;
    ::operator delete(current_);
    current_ = previous;
  }
}

Document::Block* Document::addBlock(std::size_t bytes, Block*& previous) {
  void* memory = ::operator new(bytes);
  total_ += bytes;
  return previous = new (memory) Block{this, previous};
}

Document::Place Document::placeInNewBlock(std::size_t bytes) {
  constexpr auto distance = static_cast<std::uint32_t>(sizeof(Block) / unit);
  const std::size_t blockSize = std::clamp(total_ / 8, smallestBlock, largestBlock);
  if (current_ && bytes > blockSize / 4) {
    // A large value gets its own block; the current block stays in use, so that its free rest is
    // not lost.
    Block* own = addBlock(sizeof(Block) + bytes, current_->previous);
    return {own + 1, distance};
  }
  addBlock(std::max(blockSize, sizeof(Block) + bytes), current_);
  next_ = start() + sizeof(Block);
  end_ = start() + std::max(blockSize, sizeof(Block) + bytes);
  const Place place{next_, distance};
  next_ += bytes;
  return place;
}

void* Document::do_allocate(std::size_t bytes, [[maybe_unused]] std::size_t alignment) {
  assert(alignment <= unit);
  return place(bytes).memory;
}

}  // namespace qz::toolkit
