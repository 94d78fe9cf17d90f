// SPDX-License-Identifier: MIT
// Finds the file of a script, and says what is wrong with it.

#include "hosts/qt/script_reading.hpp"

#include <QDir>
#include <QFileInfo>

#include "qz/property_list/reader.hpp"
#include "qz/script_problem.hpp"

namespace qz::hosts::qt {

namespace {

// Returns the endings of files in the locale's language, the most special first. The other
// languages that a user understands are left out: the file without an ending may be in a better
// one.
QStringList endingsFor(const QLocale& locale) {
  QStringList endings;
  for (QString name : locale.uiLanguages()) {
    if (QLocale(name).language() == locale.language()) endings << '_' + name.replace('-', '_');
  }
  return endings << '_' + QLocale::languageToCode(locale.language());
}

std::string translated(const QString& path, const toolkit::Files& files, const QLocale& locale) {
  const QString suffix = '.' + QFileInfo(path).suffix();
  const QString stem = path.endsWith(suffix) ? path.chopped(suffix.size()) : path;
  for (const QString& ending : endingsFor(locale)) {
    std::string candidate = (stem + ending + path.mid(stem.size())).toStdString();
    if (files.fileExistsAtPath(candidate)) return candidate;
  }
  return path.toStdString();
}

// Puts the bytes of the file into `script`, or the problem.
void readFile(const QString& path, const toolkit::Files& files, const QLocale& locale,
              ReadScript& script) {
  const QString directory = QString::fromStdString(files.resourcePath());
  const QString whole = QDir::isAbsolutePath(path) ? path : directory + '/' + path;
  const std::string found = translated(whole, files, locale);
  const auto bytes = files.contentsAtPath(found);
  if (!bytes) {
    script.problem =
        files.fileExistsAtPath(found) ? "the file cannot be read" : "the file does not exist";
  } else {
    script.bytes = *bytes;
  }
}

void parse(ReadScript& script) {
  const auto result = toolkit::readPropertyList(script.bytes);
  script.lists = toolkit::asDictionary(result.value);
  if (result.refusal) {
    script.problem = "it is not a property list: " + result.refusal->description();
  } else if (!script.lists) {
    script.problem = "it is not a dictionary of lists";
  } else if (script.lists->count() == 0) {
    script.problem = "it contains no list";
  } else {
    script.problem = problemOf(script.lists);
  }
}

}  // namespace

ReadScript readScript(const ScriptSource& source, const toolkit::Files& files,
                      const QLocale& locale) {
  ReadScript script;
  if (source.bytes()) {
    script.bytes = source.bytes()->toStdString();
  } else if (source.path().isEmpty()) {
    script.problem = source.name().isEmpty() ? "the path is empty"
                                             : "only URLs of files and resources can be played";
  } else {
    readFile(source.path(), files, locale, script);
  }
  if (script.problem.empty()) parse(script);
  return script;
}

}  // namespace qz::hosts::qt
