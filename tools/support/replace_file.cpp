// SPDX-License-Identifier: MIT
#include "tools/support/replace_file.hpp"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstdlib>
#include <cstring>
#include <filesystem>
#include <utility>

#include "tools/support/failure.hpp"

namespace qz::tools {
namespace {

namespace fs = std::filesystem;

[[noreturn]] void cannotWrite(const std::string& path, int error) {
  throw Failure(ExitStatus::failed, path + ": cannot be written (" + std::strerror(error) + ")");
}

/// An open file; messages name it `path`.
class Output {
 public:
  Output(int descriptor, std::string path) : descriptor_(descriptor), path_(std::move(path)) {
    if (descriptor_ < 0) cannotWrite(path_, errno);
  }
  ~Output() {
    if (descriptor_ >= 0) ::close(descriptor_);
  }
  Output(const Output&) = delete;
  Output& operator=(const Output&) = delete;

  void write(std::string_view bytes) {
    while (!bytes.empty()) {
      const ssize_t written = ::write(descriptor_, bytes.data(), bytes.size());
      if (written > 0) bytes.remove_prefix(static_cast<std::size_t>(written));
      if (written < 0 && errno != EINTR) cannotWrite(path_, errno);
    }
  }
  void setPermissions(mode_t mode) { require(::fchmod(descriptor_, mode)); }
  /// Waits until the file is on the disk. A full disk is reported here at the latest.
  void finish() {
    require(::fsync(descriptor_));
    require(::close(std::exchange(descriptor_, -1)));
  }

 private:
  void require(int result) const {
    if (result != 0) cannotWrite(path_, errno);
  }

  int descriptor_;
  std::string path_;
};

/// Deletes its file on destruction, unless the file was renamed before.
class TemporaryFile {
 public:
  explicit TemporaryFile(std::string path) : path_(std::move(path)) {}
  ~TemporaryFile() { ::unlink(path_.c_str()); }
  TemporaryFile(const TemporaryFile&) = delete;
  TemporaryFile& operator=(const TemporaryFile&) = delete;

 private:
  std::string path_;
};

/// Returns the permissions of the file that is replaced, or those of any new file.
mode_t permissionsFor(const fs::path& target) {
  struct stat found {};
  if (::stat(target.c_str(), &found) == 0) return found.st_mode & 07777;
  const mode_t mask = ::umask(0);
  ::umask(mask);
  return 0666 & ~mask;
}

void replaceRegularFile(const std::string& path, std::string_view contents) {
  std::error_code error;
  const fs::path target = fs::is_symlink(path) ? fs::weakly_canonical(path, error) : fs::path(path);
  std::string beside = target.string() + ".XXXXXX";
  Output output(::mkstemp(beside.data()), path);
  const TemporaryFile temporary(beside);
  output.setPermissions(permissionsFor(target));
  output.write(contents);
  output.finish();
  if (std::rename(beside.c_str(), target.c_str()) != 0) cannotWrite(path, errno);
}

}  // namespace

void replaceFile(const std::string& path, std::string_view contents) {
  std::error_code error;
  const fs::file_status status = fs::status(path, error);
  if (fs::is_directory(status)) cannotWrite(path, EISDIR);
  if (fs::exists(status) && !fs::is_regular_file(status)) {
    Output(::open(path.c_str(), O_WRONLY), path).write(contents);
  } else {
    replaceRegularFile(path, contents);
  }
}

}  // namespace qz::tools
