// SPDX-License-Identifier: MIT
// Images by name.

#include "toolkit/memory/images.hpp"

#include "tests/memory/support.hpp"
#include "toolkit/backend/image_names.hpp"

namespace qz::toolkit::memory::test {
namespace {

class ImagesTest : public MemoryTest {
 protected:
  ImagesTest() { driver.setResourcePath(directory.path()); }
  Ref<Image> find(std::string_view name) { return toolkit.images().imageNamed(name); }
  /// Returns the name of the file that `name` finds; empty when it finds none.
  std::string fileOf(std::string_view name) {
    const auto image = std::dynamic_pointer_cast<MemoryImage>(find(name).pointer());
    return image ? std::filesystem::path(image->path()).filename().string() : "";
  }

  Directory directory;
};

TEST_F(ImagesTest, ANameIsTriedWithTheUsualSuffixes) {
  for (const std::string_view suffix : imageSuffixes) {
    const std::string file = "sky." + std::string(suffix);
    directory.write(file, "");
    EXPECT_EQ(fileOf("sky"), file);
    EXPECT_EQ(fileOf(file), file);
    directory.remove(file);
    EXPECT_FALSE(find("sky"));
  }
}

TEST_F(ImagesTest, EarlierSuffixesComeFirst) {
  for (const char* const file : {"sky.pdf", "sky.jpeg", "sky.png", "sky.jpg"}) {
    directory.write(file, "");
  }
  EXPECT_EQ(fileOf("sky"), "sky.png");
  EXPECT_EQ(fileOf("sky.pdf"), "sky.pdf");
}

TEST_F(ImagesTest, OnlyImageFilesAreFoundByNamesThatFit) {
  directory.write("notes.txt", "");
  directory.write("v1.2.png", "");
  directory.write("Photo.PNG", "");
  directory.write("bare", "");
  directory.write("folder.png/inside.png", "");
  // Some file systems ignore the case of names.
  const char* const photo = std::filesystem::exists(directory.path("photo.png")) ? "photo.png" : "";
  const struct {
    const char* name;
    const char* file;  // empty: not found
  } cases[] = {
      {"notes.txt", ""},          {"notes", ""},    {"v1.2", "v1.2.png"}, {"bare", ""},
      {"Photo.PNG", "Photo.PNG"}, {"photo", photo}, {"folder", ""},       {"folder.png", ""},
      {"missing.png", ""},
  };
  for (const auto& c : cases) EXPECT_EQ(fileOf(c.name), c.file) << c.name;
}

TEST_F(ImagesTest, ANameIsNoPath) {
  using namespace std::string_view_literals;
  directory.write("sub/inside.png", "");
  directory.write(R"(sub/..\inside.png)", "");
  directory.write("inside.png", "");
  directory.write(".png", "");
  directory.write("...png", "");
  driver.setResourcePath(directory.path("sub"));
  EXPECT_TRUE(find("inside"));
  for (const std::string_view name :
       {""sv, ".."sv, "../inside"sv, "../inside.png"sv, "..\\inside"sv, "./inside"sv,
        "/inside.png"sv, "inside.png\0x"sv}) {
    EXPECT_FALSE(find(name)) << name;
  }
  driver.setResourcePath(directory.path());
  for (const std::string_view name : {""sv, ".."sv, "sub/inside"sv}) EXPECT_FALSE(find(name));
}

TEST_F(ImagesTest, ANameFindsTheSameImageEveryTime) {
  directory.write("sky.png", "");
  const Ref<Image> sky = find("sky");
  EXPECT_EQ(sky->name(), "sky");
  EXPECT_EQ(find("sky"), sky);
  EXPECT_NE(find("sky.png"), sky);
  EXPECT_EQ(find("sky.png")->name(), "sky.png");
}

TEST_F(ImagesTest, AnImageIsNotFoundOnceItsFileIsGone) {
  directory.write("sky.png", "");
  const Ref<Image> sky = find("sky");
  directory.remove("sky.png");
  EXPECT_FALSE(find("sky"));
  EXPECT_EQ(sky->name(), "sky");
  directory.write("sky.gif", "");
  EXPECT_EQ(fileOf("sky"), "sky.gif");
  EXPECT_NE(find("sky"), sky);
}

TEST_F(ImagesTest, AnotherResourceDirectoryHasOtherImages) {
  directory.write("sky.png", "");
  directory.write("night/sky.png", "");
  const Ref<Image> day = find("sky");
  driver.setResourcePath(directory.path("night"));
  EXPECT_NE(find("sky"), day);
  driver.setResourcePath(directory.path("none"));
  EXPECT_FALSE(find("sky"));
}

}  // namespace
}  // namespace qz::toolkit::memory::test
