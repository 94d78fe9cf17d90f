// SPDX-License-Identifier: MIT
// What a Qt host can give as a script.
#pragma once

#include <QByteArray>
#include <QString>
#include <QUrl>
#include <QVariant>
#include <optional>
#include <string>
#include <string_view>

#include "qz/api.hpp"

namespace qz::hosts::qt {

/// A script to play: where its file is, or the bytes of the file. Made from what a host has:
///
/// - a path: absolute, relative to the resource directory, or of a resource (":/tour.plist");
/// - a URL of a file or a resource ("file:", "qrc:"), as a QUrl or as text;
/// - a QByteArray with the property list itself.
class QZ_API ScriptSource {
 public:
  // Implicit on purpose: these are arguments of `WalkThrough::play`.
  // NOLINTBEGIN(google-explicit-constructor)
  ScriptSource(const QString& path);
  ScriptSource(const QUrl& url);
  ScriptSource(const QByteArray& bytes) : bytes_(bytes) {}
  ScriptSource(const char* path) : ScriptSource(QString(path)) {}
  ScriptSource(std::string_view path);
  ScriptSource(const std::string& path) : ScriptSource(std::string_view(path)) {}
  // NOLINTEND(google-explicit-constructor)

  /// Returns the path; empty for bytes, and for a URL of another kind.
  const QString& path() const { return path_; }
  /// Returns the bytes; absent for a path or a URL.
  const std::optional<QByteArray>& bytes() const { return bytes_; }
  /// Returns the name of the script for messages.
  QString name() const;

  /// Returns the source as a value that settings can keep, and the source of such a value.
  QVariant toVariant() const;
  static ScriptSource fromVariant(const QVariant& value);

 private:
  QString path_;
  QString given_;  // as the host wrote it
  std::optional<QByteArray> bytes_;
};

}  // namespace qz::hosts::qt
