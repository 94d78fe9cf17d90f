// SPDX-License-Identifier: MIT
// Makes paths of all that names a file.

#include "qz/hosts/qt/script_source.hpp"

namespace qz::hosts::qt {

namespace {

// Returns the path of a file or a resource; empty for any other URL.
QString pathOf(const QUrl& url) {
  if (url.scheme() == "qrc") return ':' + url.path();
  if (url.isLocalFile()) return url.toLocalFile();
  return url.isRelative() ? url.path() : QString();
}

bool isUrl(const QString& text) {
  return text.startsWith("qrc:") || text.startsWith("file:") || text.contains("://");
}

}  // namespace

ScriptSource::ScriptSource(const QString& path)
    : path_(isUrl(path) ? pathOf(QUrl(path)) : path), given_(path) {}

ScriptSource::ScriptSource(const QUrl& url)
    : path_(pathOf(url)), given_(url.isRelative() ? path_ : url.toString()) {}

ScriptSource::ScriptSource(std::string_view path)
    : ScriptSource(QString::fromUtf8(path.data(), static_cast<qsizetype>(path.size()))) {}

QString ScriptSource::name() const { return bytes_ ? QString("(bytes)") : given_; }

QVariant ScriptSource::toVariant() const { return bytes_ ? QVariant(*bytes_) : QVariant(given_); }

ScriptSource ScriptSource::fromVariant(const QVariant& value) {
  if (value.typeId() == QMetaType::QByteArray) return value.toByteArray();
  return value.toString();
}

}  // namespace qz::hosts::qt
