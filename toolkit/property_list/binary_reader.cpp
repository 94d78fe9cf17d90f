// Binary property lists.
#include <algorithm>
#include <bit>
#include <limits>
#include <span>
#include <string>

#include "toolkit/property_list/binary_layout.hpp"
#include "toolkit/property_list/collections.hpp"
#include "toolkit/property_list/format_readers.hpp"
#include "toolkit/property_list/key_index.hpp"
#include "toolkit/property_list/scalars.hpp"
#include "toolkit/property_list/utf8.hpp"

namespace toolkit {
namespace {

using binary::Marker;
using binary::Trailer;

constexpr std::size_t largestSize = 16;  // of an offset or a reference

// Objects may overlap, and a small file can so hold objects that are huge all together. What a file
// honestly needs is its own size; this many times as much is read, and a little more for tiny files.
constexpr std::size_t mostOverlap = 8;
constexpr std::size_t overlapForFree = 64 * 1024;

[[noreturn]] void refuse(std::size_t offset, std::string reason) {
  throw RefusedAt{offset, std::move(reason)};
}

Trailer readTrailer(std::string_view bytes) {
  const std::size_t start = bytes.size() - Trailer::size;
  const std::string_view trailer = bytes.substr(start);
  return {static_cast<std::uint8_t>(trailer[6]), static_cast<std::uint8_t>(trailer[7]),
          binary::number(trailer.substr(8, 8)), binary::number(trailer.substr(16, 8)),
          binary::number(trailer.substr(24, 8))};
}

/// Whether a number of `size` bytes can count up to `greatest` and one beyond.
bool reaches(std::size_t size, std::uint64_t greatest) {
  return size >= sizeof greatest || greatest < std::uint64_t{1} << (8 * size);
}

void checkTrailer(const Trailer& trailer, std::string_view bytes) {
  const std::size_t start = bytes.size() - Trailer::size;
  const auto check = [&](bool holds, std::size_t field, const char* reason) {
    if (!holds) refuse(start + field, reason);
  };
  check(trailer.offsetSize >= 1 && trailer.offsetSize <= largestSize, 6,
        "the offsets' size is not from 1 to 16");
  check(trailer.referenceSize >= 1 && trailer.referenceSize <= largestSize, 7,
        "the references' size is not from 1 to 16");
  check(trailer.objectCount >= 1, 8, "there is no object");
  check(trailer.topObject < trailer.objectCount, 16, "the top object does not exist");
  check(trailer.tableOffset > binary::headerSize && trailer.tableOffset < start, 24,
        "the offset table does not lie between the header and the trailer");
  const std::uint64_t tableSize = start - trailer.tableOffset;
  check(tableSize % trailer.offsetSize == 0 && tableSize / trailer.offsetSize == trailer.objectCount,
        8, "the offset table does not fill the space up to the trailer");
  check(reaches(trailer.referenceSize, trailer.objectCount), 7,
        "the references are too small for the number of objects");
  check(reaches(trailer.offsetSize, trailer.tableOffset), 6,
        "the offsets are too small for the objects' space");
}

class BinaryReader {
 public:
  BinaryReader(std::string_view bytes, Document& document, ValueOffsets* offsets);
  Value* root();

 private:
  /// The bytes of an object behind its marker, which are taken one part after the other.
  struct Content {
    std::size_t object;     // where it starts
    std::size_t at;         // what comes next
    std::size_t length;     // in whatever the object counts in
  };

  std::uint64_t offsetOf(std::uint64_t index) const;
  Value* object(std::uint64_t index, std::size_t depth);
  Value* read(std::size_t offset, std::size_t depth);
  Value* simple(std::size_t offset);
  Value* integer(std::size_t offset);
  Value* real(std::size_t offset);
  Value* date(std::size_t offset);
  Value* uid(std::size_t offset);
  Value* data(std::size_t offset);
  Value* ascii(std::size_t offset);
  Value* utf16(std::size_t offset);
  Value* array(std::size_t offset, std::size_t depth);
  Value* set(std::size_t offset, std::size_t depth);
  Value* dictionary(std::size_t offset, std::size_t depth);

  unsigned low(std::size_t offset) const { return static_cast<unsigned char>(bytes_[offset]) & 15; }
  std::string_view fixed(std::size_t offset, std::size_t size);
  std::string_view counted(std::size_t offset, std::size_t unitSize);
  std::string_view take(std::size_t object, std::size_t at, std::uint64_t count,
                        std::size_t unitSize);
  void readReferences(std::string_view references, std::size_t depth);

  std::string_view bytes_;
  Trailer trailer_;
  std::size_t end_;  // of the objects
  Document& document_;
  ValueOffsets* offsets_;
  std::vector<Value*> objects_;  // by index, as far as they are read
  std::vector<Value*> pending_;  // what the open containers hold so far, the outermost's first
  std::string buffer_;
  std::size_t budget_;  // how many bytes of objects may still be read
};

}  // namespace

Value* readBinary(std::string_view bytes, Document& document, ValueOffsets* offsets) {
  if (!bytes.starts_with(binary::magic)) refuse(0, "the file does not start with \"bplist0\"");
  if (bytes.size() <= binary::headerSize + Trailer::size) {
    refuse(bytes.size(), "the file is too short for a header, an object and a trailer");
  }
  return BinaryReader(bytes, document, offsets).root();
}

}  // namespace toolkit
