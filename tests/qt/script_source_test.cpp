// SPDX-License-Identifier: MIT
// Where a Qt host's scripts, images and fonts can be, and in which language.

#include "qz/hosts/qt/script_source.hpp"

#include <QDirIterator>
#include <QFontDatabase>
#include <QLabel>
#include <QLoggingCategory>
#include <QPushButton>
#include <QStandardPaths>
#include <QTemporaryDir>
#include <fstream>

#include "qz/hosts/qt/walk_through.hpp"
#include "tests/qt/support.hpp"

namespace qz {

namespace {

using hosts::qt::ScriptSource;
using hosts::qt::WalkThrough;

struct ScriptSources : testing::Test {
  QWidget window;
  QPushButton button{"Host", &window};
  QLabel picture{&window};
  std::string logged;  // the last line
  WalkThrough walkThrough;

  ScriptSources() {
    button.setProperty("qzTag", 1);
    picture.setProperty("qzTag", 3);
    picture.setProperty("qzImageView", true);
    walkThrough.setLocale(QLocale("en_GB"));
    walkThrough.toolkit().log().setSink([this](std::string_view line) { logged = line; });
    window.show();
  }

  /// Plays the script; returns what it has shown on the button, or the last line of the log.
  std::string played(const ScriptSource& script) {
    if (!walkThrough.play(script, window)) return logged;
    std::string title = button.text().toStdString();
    walkThrough.end();
    return title;
  }
};

TEST_F(ScriptSources, AreAllThatAHostHas) {
  QTemporaryDir directory;
  const QString path = directory.filePath("der Weg #1.plist");
  QFile::copy(":/guided/tour.plist", path);
  walkThrough.setResources(directory.path());
  const ScriptSource sources[] = {
      path,
      path.toStdString(),
      std::string_view("der Weg #1.plist"),
      QUrl::fromLocalFile(path),
      QUrl::fromLocalFile(path).toString(QUrl::FullyEncoded),
      QUrl("der%20Weg%20%231.plist"),
      ":/guided/tour.plist",
      "qrc:/guided/tour.plist",
      QUrl("qrc:/guided/tour.plist"),
      QByteArray("{ 0 = ((SET_TITLE_FOR_OBJECT_ID, English, 1)); }"),
  };
  for (const ScriptSource& source : sources) {
    EXPECT_EQ(played(source), "English") << source.name().toStdString();
    EXPECT_EQ(played(ScriptSource::fromVariant(source.toVariant())), "English");
    EXPECT_EQ(button.text(), "Host");
  }
}

TEST_F(ScriptSources, AreNamedInRefusals) {
  const struct {
    ScriptSource source;
    const char* name;
    const char* reason;
  } cases[] = {
      {QUrl("qrc:/guided/none.plist"), "qrc:/guided/none.plist", "the file does not exist"},
      {QUrl("https://example.org/a"), "https://example.org/a",
       "only URLs of files and resources can be played"},
      {":/guided", ":/guided", "the file cannot be read"},
      {QByteArray("()"), "(bytes)", "it is not a dictionary of lists"},
      {QUrl(), "", "the path is empty"},
  };
  for (const auto& c : cases) {
    EXPECT_EQ(played(c.source),
              std::string("The walk-through ") + c.name + " is not played: " + c.reason);
  }
}

TEST_F(ScriptSources, AreInTheUsersLanguageIfThereIsAFileInIt) {
  const struct {
    const char* locale;
    const char* title;
  } cases[] = {
      {"de_DE", "Deutsch"}, {"de_AT", "Deutsch"}, {"de", "Deutsch"},
      {"en_GB", "English"}, {"fr_FR", "English"}, {"C", "English"},
  };
  for (const auto& c : cases) {
    walkThrough.setLocale(QLocale(c.locale));
    EXPECT_EQ(played(":/guided/tour.plist"), c.title) << c.locale;
  }
}

TEST_F(ScriptSources, PreferTheFileOfTheCountry) {
  QTemporaryDir directory;
  walkThrough.setResources(directory.path());
  const auto write = [&](const char* name, const char* title) {
    std::ofstream(directory.filePath(name).toStdString())
        << "{ 0 = ((SET_TITLE_FOR_OBJECT_ID, " << title << ", 1)); }";
  };
  write("tour.plist", "English");
  write("tour_de.plist", "Deutsch");
  write("tour_de_AT.plist", "Oesterreichisch");
  write("script", "plain");
  write("script_de", "einfach");
  walkThrough.setLocale(QLocale("de_AT"));
  EXPECT_EQ(played("tour.plist"), "Oesterreichisch");
  EXPECT_EQ(played("script"), "einfach");
  walkThrough.setLocale(QLocale("de_DE"));
  EXPECT_EQ(played("tour.plist"), "Deutsch");
}

TEST_F(ScriptSources, FollowTheLocaleOfTheApplication) {
  WalkThrough fresh;
  fresh.toolkit().log().setSink([](std::string_view) {});
  QLocale::setDefault(QLocale("de_DE"));
  ASSERT_TRUE(fresh.play(":/guided/tour.plist", window));
  EXPECT_EQ(button.text(), "Deutsch");
  QLocale::setDefault(QLocale::system());
}

TEST_F(ScriptSources, HaveTheirImagesInResourcesToo) {
  walkThrough.setResources(":/guided/");
  EXPECT_EQ(walkThrough.toolkit().files().resourcePath(), ":/guided");
  ASSERT_TRUE(walkThrough.play("tour.plist", window));
  const auto image = walkThrough.toolkit().images().imageNamed("parcel");
  ASSERT_TRUE(image);
  EXPECT_EQ(image, walkThrough.toolkit().images().imageNamed("parcel")) << "read once";
  EXPECT_FALSE(walkThrough.toolkit().images().imageNamed("guided"));
  EXPECT_FALSE(walkThrough.toolkit().images().imageNamed("none"));
  EXPECT_FALSE(picture.pixmap().isNull());
}

TEST_F(ScriptSources, BringTheirFonts) {
  QString font;
  for (const QString& place : QStandardPaths::standardLocations(QStandardPaths::FontsLocation)) {
    QDirIterator files(place, {"LiberationSans-Regular.ttf"}, QDir::Files,
                       QDirIterator::Subdirectories);
    if (files.hasNext()) font = files.next();
  }
  QFile file(font);
  ASSERT_TRUE(file.open(QIODevice::ReadOnly)) << "the tests need the Liberation fonts";
  QByteArray bytes = file.readAll();
  for (const bool isWide : {false, true}) {
    const auto name = [&](const QByteArray& text) {
      QByteArray units;
      for (const char c : text) (isWide ? units.append('\0') : units).append(c);
      return units;
    };
    bytes.replace(name("Liberation Sans"), name("Travelling Sans"));
  }
  QTemporaryDir directory;
  QFile own(directory.filePath("own.ttf"));
  ASSERT_TRUE(own.open(QIODevice::WriteOnly));
  own.write(bytes);
  own.close();
  {
    WalkThrough other;
    other.setResources(directory.path());
    EXPECT_TRUE(other.toolkit().fonts().fontWithName("Travelling Sans", 12));
  }
  EXPECT_FALSE(walkThrough.toolkit().fonts().fontWithName("Travelling Sans", 12));
}

QStringList messages;
void keepMessage(QtMsgType, const QMessageLogContext& context, const QString& message) {
  messages << QString(context.category) + ": " + message;
}

TEST_F(ScriptSources, AreSpokenOfInTheLoggingCategory) {
  walkThrough.toolkit().log().setSink({});
  const auto before = qInstallMessageHandler(keepMessage);
  walkThrough.play("", window);
  QLoggingCategory::setFilterRules("qz.walkthrough=false");
  walkThrough.play("", window);
  QLoggingCategory::setFilterRules("");
  qInstallMessageHandler(before);
  EXPECT_EQ(messages, QStringList{"qz.walkthrough: The walk-through  is not played: the path is "
                                  "empty"});
}

}  // namespace

}  // namespace qz
