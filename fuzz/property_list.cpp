// SPDX-License-Identifier: MIT
// Property lists: what must hold of any bytes that are read as one.
//
// There is a fuzzer for each of the three formats, all of them this. Their seeds and dictionaries
// keep the inputs to the format; the reader itself finds out which one it has before it.
#include <cstdint>
#include <string>
#include <string_view>

#include "fuzz/require.hpp"
#include "toolkit/exception.hpp"
#include "toolkit/property_list/binary_writer.hpp"
#include "toolkit/property_list/canonical_dump.hpp"
#include "toolkit/property_list/reader.hpp"
#include "toolkit/property_list/walk.hpp"
#include "toolkit/property_list/xml_writer.hpp"

namespace {

using fuzz::require;

/// A small binary file can stand for more values, shared over and over, than fit into any memory.
constexpr std::size_t mostVisits = 100'000;

/// Whether a 32-bit real is in it, which XML cannot tell from one of 64 bits.
bool hasShortReal(const std::string& dump) { return dump.find("\"w\":32}") != std::string::npos; }

/// The dump of what XML tells apart: 0 and -0 seconds are one moment, and one text there.
std::string inXml(std::string dump) {
  const std::string minusZero = R"({"date":"-0"})";
  for (auto at = dump.find(minusZero); at != std::string::npos; at = dump.find(minusZero, at)) {
    dump.replace(at, minusZero.size(), R"({"date":"0"})");
  }
  return dump;
}

/// Writes the value, reads it back, and requires an equal one; a refusal to write needs a reason.
template <class Write>
void checkRoundTrip(const toolkit::ValueRef<>& value, const std::string& dump, Write write) {
  try {
    const std::string written = write(value);
    const toolkit::ReadResult again = toolkit::readPropertyList(written);
    require(!again.refusal,
            "what was written is read, but " + (again.refusal ? again.refusal->description() : ""));
    const std::string dumpAgain = toolkit::canonicalDump(*again.value);
    require(dumpAgain == dump, "the same value is read back:\n" + dump + "\n" + dumpAgain);
  } catch (const toolkit::InvalidArgumentException& refusal) {
    require(!refusal.reason().empty(), "a refusal to write has a reason");
  }
}

/// Reads the bytes, with positions and without, and writes what they are in both formats.
void checkReading(std::string_view bytes) {
  toolkit::PositionTable positions;
  const toolkit::ReadResult result = toolkit::readPropertyList(bytes, &positions);
  const toolkit::ReadResult plain = toolkit::readPropertyList(bytes);
  require(static_cast<bool>(result.value) != result.refusal.has_value(),
          "bytes are a value or refused");
  require(static_cast<bool>(plain.value) == static_cast<bool>(result.value),
          "positions change nothing");
  if (result.refusal) {
    require(!result.refusal->reason.empty(), "a refusal has a reason");
    return;
  }
  require(positions.of(*result.value).has_value(), "the root has a position");
  if (toolkit::visitsInWalk(*result.value) > mostVisits) return;
  const std::string dump = toolkit::canonicalDump(*result.value);
  require(toolkit::canonicalDump(*plain.value) == dump, "positions change no value");
  checkRoundTrip(result.value, dump, toolkit::writeBinaryPropertyList);
  if (!hasShortReal(dump)) checkRoundTrip(result.value, inXml(dump), toolkit::writeXmlPropertyList);
  static_cast<void>(result.value->description());
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  checkReading({reinterpret_cast<const char*>(data), size});
  return 0;
}
