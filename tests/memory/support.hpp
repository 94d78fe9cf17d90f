// SPDX-License-Identifier: MIT
// Shared by the tests of the memory toolkit: recorders, and a temporary directory.
#pragma once

#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <functional>
#include <memory>
#include <random>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "drivers/memory/memory_driver.hpp"
#include "qz/toolkit/application.hpp"
#include "qz/toolkit/responder.hpp"
#include "toolkit/memory/parts.hpp"

namespace qz::toolkit::memory::test {

/// Performs one action, and records the actions asked for and their senders.
class Recorder : public Responder {
 public:
  explicit Recorder(std::string understood = "pressed:") : understood_(std::move(understood)) {}

  bool tryToPerform(std::string_view action, const Ref<View>& sender) override {
    asked.emplace_back(action);
    if (action != understood_) return false;
    senders.push_back(sender->tag());
    if (perform) perform(sender);
    performed.emplace_back(action);
    return true;
  }

  std::vector<std::string> asked;      // all actions it was asked to perform
  std::vector<std::string> performed;  // the actions performed, each read after performing it
  std::vector<Tag> senders;            // the tags of the senders of those performed
  std::function<void(const Ref<View>&)> perform;  // called when an action is performed

 private:
  std::string understood_;
};

/// Records the ends of sheets.
class SheetRecorder : public SheetDelegate {
 public:
  void sheetDidEnd(const Ref<Window>& sheet, long returnCode, void* contextInfo) override {
    sheets.push_back(sheet);
    codes.push_back(returnCode);
    context = contextInfo;
    if (orderOut) sheet->orderOut();
  }

  std::vector<Ref<Window>> sheets;
  std::vector<long> codes;
  void* context = nullptr;
  bool orderOut = false;
};

/// A new directory, removed with its contents on destruction.
class Directory {
 public:
  Directory() {
    path_ = std::filesystem::temp_directory_path() /
            ("memory-toolkit-" + std::to_string(std::random_device()()));
    std::filesystem::create_directories(path_);
  }
  ~Directory() { std::filesystem::remove_all(path_); }
  Directory(const Directory&) = delete;
  Directory& operator=(const Directory&) = delete;

  std::string path() const { return path_.generic_string(); }
  std::string path(const std::string& name) const { return (path_ / name).generic_string(); }
  void write(const std::string& name, std::string_view contents) const {
    std::filesystem::create_directories((path_ / name).parent_path());
    std::ofstream(path_ / name, std::ios::binary) << contents;
  }
  void remove(const std::string& name) const { std::filesystem::remove_all(path_ / name); }

 private:
  std::filesystem::path path_;
};

/// Provides a driver, with a host's window on its screen.
class MemoryTest : public testing::Test {
 protected:
  Ref<View> make(drivers::ViewKind kind, Tag tag = 1) {
    return makeIn(window->contentView(), kind, tag);
  }
  Ref<View> makeIn(const Ref<View>& parent, drivers::ViewKind kind, Tag tag) {
    return driver.makeView(kind, tag, {10, 20, 30, 40}, parent);
  }
  /// Returns a new button with this target and the action "pressed:".
  Ref<Button> makeButton(const std::shared_ptr<Responder>& target,
                         drivers::ViewKind kind = drivers::ViewKind::button, Tag tag = 1) {
    Ref<Button> button = asButton(make(kind, tag));
    button->setTarget(target);
    button->setAction("pressed:");
    return button;
  }

  drivers::MemoryDriver driver;
  MemoryToolkit& toolkit = driver.toolkit();
  Application& application = toolkit.application();
  Ref<Window> window = driver.makeWindow({100, 100, 640, 480});
};

}  // namespace qz::toolkit::memory::test
