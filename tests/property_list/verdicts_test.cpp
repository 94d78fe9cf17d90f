// SPDX-License-Identifier: MIT
// Compares every file of tests/data/property-lists with the result of the platform's own reader.
#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <iterator>
#include <set>
#include <sstream>
#include <string>
#include <vector>

#include "qz/property_list/canonical_dump.hpp"
#include "qz/property_list/reader.hpp"
#include "tests/property_list/sha256.hpp"

namespace qz::toolkit {
namespace {

const std::filesystem::path folder = std::filesystem::path(QZ_TEST_DATA) / "property-lists";
constexpr std::size_t longestDump = 20000;  // the table holds the digest of a longer one

std::string contentsOf(const std::filesystem::path& path) {
  std::ifstream file(path, std::ios::binary);
  EXPECT_TRUE(file.is_open()) << path;
  return {std::istreambuf_iterator<char>(file), {}};
}

struct Row {
  std::string path, verdict, format, root, asDictionary, dump;
};

std::vector<Row> rows() {
  std::ifstream file(folder / "verdicts.tsv");
  std::vector<Row> rows;
  std::string line;
  std::getline(file, line);  // the names of the columns
  while (std::getline(file, line)) {
    std::istringstream columns(line);
    Row row;
    for (std::string* column :
         {&row.path, &row.verdict, &row.format, &row.root, &row.asDictionary, &row.dump}) {
      std::getline(columns, *column, '\t');
    }
    rows.push_back(row);
  }
  return rows;
}

std::string nameOf(Format format) {
  if (format == Format::oldStyle) return "openstep";
  return std::string(formatRow(format).name);
}

std::string nameOf(Value::Kind kind) {
  switch (kind) {
    case Value::Kind::string:
      return "string";
    case Value::Kind::array:
      return "array";
    case Value::Kind::dictionary:
      return "dict";
    default:
      return "other";
  }
}

Row rowOf(const std::string& path) {
  const std::string bytes = contentsOf(folder / path);
  const ReadResult result = readPropertyList(bytes);
  EXPECT_EQ(result.value.pointer() == nullptr, result.refusal.has_value()) << path;
  Row row{path, "FAIL", "-", "-", dictionaryFromPropertyList(bytes) ? "dict" : "nil", "-"};
  if (!result.value) return row;
  row.verdict = "OK";
  row.format = nameOf(result.format);
  row.root = nameOf(result.value->kind());
  row.dump = canonicalDump(*result.value);
  if (row.dump.size() > longestDump) row.dump = "sha256:" + sha256(row.dump);
  return row;
}

TEST(Verdicts, AgreeWithThePlatformToTheLetter) {
  const std::vector<Row> table = rows();
  for (const Row& expected : table) {
    const Row actual = rowOf(expected.path);
    EXPECT_EQ(actual.verdict, expected.verdict) << expected.path;
    EXPECT_EQ(actual.format, expected.format) << expected.path;
    EXPECT_EQ(actual.root, expected.root) << expected.path;
    EXPECT_EQ(actual.asDictionary, expected.asDictionary) << expected.path;
    EXPECT_EQ(actual.dump, expected.dump) << expected.path;
  }
  EXPECT_FALSE(table.empty());
}

TEST(Verdicts, CoverEveryFileThatIsThere) {
  std::set<std::string> named;
  for (const Row& row : rows()) named.insert(row.path);
  std::set<std::string> present;
  for (const auto& entry : std::filesystem::recursive_directory_iterator(folder)) {
    const std::string path = entry.path().lexically_relative(folder).generic_string();
    if (entry.is_regular_file() && path != "verdicts.tsv") present.insert(path);
  }
  EXPECT_FALSE(named.empty());
  EXPECT_EQ(named, present);
}

}  // namespace
}  // namespace qz::toolkit
