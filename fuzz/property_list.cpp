// SPDX-License-Identifier: MIT
// Checks what must hold when any bytes are read as a property list.
//
// This source makes three fuzzers, one for each format. Seeds and dictionaries keep the inputs
// close to the format; the reader itself detects which format it has.
#include <cstdint>
#include <string>
#include <string_view>

#include "fuzz/require.hpp"
#include "qz/property_list/canonical_dump.hpp"
#include "qz/property_list/formats.hpp"
#include "qz/property_list/reader.hpp"
#include "qz/toolkit/exception.hpp"
#include "toolkit/property_list/walk.hpp"

namespace qz {

namespace {

using fuzz::require;

/// A small binary file can represent more values, by sharing, than fit into any memory.
constexpr std::size_t mostVisits = 100'000;

/// True if the dump has a 32-bit real, which XML cannot distinguish from a 64-bit one.
bool hasShortReal(const std::string& dump) { return dump.find("\"w\":32}") != std::string::npos; }

/// Returns the dump as it is after XML, which writes 0 and -0 seconds, the same moment, as one
/// text.
std::string inXml(std::string dump) {
  const std::string minusZero = R"({"date":"-0"})";
  for (auto at = dump.find(minusZero); at != std::string::npos; at = dump.find(minusZero, at)) {
    dump.replace(at, minusZero.size(), R"({"date":"0"})");
  }
  return dump;
}

/// Writes the value, reads it back, and requires an equal one; a refusal to write must have a
/// reason.
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

/// Reads the bytes with and without positions, and writes the value in every format.
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
  for (const toolkit::FormatRow& row : toolkit::formats()) {
    const bool isXml = row.format == toolkit::Format::xml;
    if (!row.write || (isXml && hasShortReal(dump))) continue;
    checkRoundTrip(result.value, isXml ? inXml(dump) : dump, row.write);
  }
  static_cast<void>(result.value->description());
}

}  // namespace

}  // namespace qz

using namespace qz;

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  checkReading({reinterpret_cast<const char*>(data), size});
  return 0;
}
