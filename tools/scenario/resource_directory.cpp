// SPDX-License-Identifier: MIT
// The resource directory of one scenario.

#include "tools/scenario/resource_directory.hpp"

#include <array>
#include <fstream>
#include <random>
#include <system_error>

#include "tools/scenario/unmet.hpp"
#include "tools/support/failure.hpp"

namespace qz::tools::scenario {
namespace {

namespace fs = std::filesystem;

// A white square with a black frame and its diagonals: header, 16 × 16 pixels of one grey bit each,
// compressed, and the end. Written out here so that no image library is needed.
constexpr std::array<unsigned char, 104> image = {
    0x89, 0x50, 0x4E, 0x47, 0x0D, 0x0A, 0x1A, 0x0A, 0x00, 0x00, 0x00, 0x0D, 0x49, 0x48, 0x44,
    0x52, 0x00, 0x00, 0x00, 0x10, 0x00, 0x00, 0x00, 0x10, 0x01, 0x00, 0x00, 0x00, 0x00, 0x37,
    0x88, 0xC2, 0xCC, 0x00, 0x00, 0x00, 0x2F, 0x49, 0x44, 0x41, 0x54, 0x78, 0xDA, 0x63, 0x60,
    0x60, 0x60, 0xB0, 0xFF, 0xC3, 0x10, 0xFF, 0x8B, 0x21, 0xFF, 0x1B, 0x43, 0xF9, 0x3B, 0x86,
    0xEA, 0x7B, 0x0C, 0xB5, 0xFB, 0x18, 0xEA, 0xEA, 0x40, 0x08, 0xC8, 0x00, 0x72, 0x81, 0x82,
    0x40, 0x29, 0xA0, 0x02, 0xA0, 0x32, 0x06, 0x06, 0x00, 0xA9, 0xE5, 0x11, 0xDD, 0x4A, 0x62,
    0x33, 0x38, 0x00, 0x00, 0x00, 0x00, 0x49, 0x45, 0x4E, 0x44, 0xAE, 0x42, 0x60, 0x82};

fs::path makeTemporaryDirectory() {
  // The canonical path, so that the path is the same wherever it is reported.
  const auto parent = fs::canonical(fs::temp_directory_path());
  std::random_device random;
  while (true) {
    auto path = parent / ("qz-walkthrough-" + std::to_string(random()));
    if (fs::create_directory(path)) return path;
  }
}

}  // namespace

ResourceDirectory::ResourceDirectory() {
  try {
    root_ = makeTemporaryDirectory();
    fs::permissions(root_, fs::perms::owner_all);
    fs::create_directory(path());
  } catch (const fs::filesystem_error& error) {
    throw Failure(ExitStatus::failed,
                  std::string("cannot make a directory for temporary files: ") + error.what());
  }
}

ResourceDirectory::~ResourceDirectory() {
  std::error_code ignored;  // the system clears away what cannot be removed
  fs::remove_all(root_, ignored);
}

std::string ResourceDirectory::path() const { return (root_ / "resources").string(); }

std::string ResourceDirectory::missingPath() const { return (root_ / "missing").string(); }

void ResourceDirectory::write(const std::string& name, std::string_view contents) const {
  const auto file = fs::path(path()) / name;
  std::error_code error;
  fs::create_directories(file.parent_path(), error);
  std::ofstream stream(file, std::ios::binary);
  stream.write(contents.data(), static_cast<std::streamsize>(contents.size()));
  stream.close();
  if (!stream) {
    throw Unmet("the file " + name + " in the resource directory", "an error writing it");
  }
}

void ResourceDirectory::writeImage(const std::string& name) const {
  write(name + ".png", std::string(image.begin(), image.end()));
}

}  // namespace qz::tools::scenario
