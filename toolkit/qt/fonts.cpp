// SPDX-License-Identifier: MIT
// The families that replace the classic ones. The first of each row is metric-compatible if such a
// family exists, so that lines break where the script's author saw them break.

#include "toolkit/qt/fonts.hpp"

#include <QFontDatabase>
#include <QGuiApplication>
#include <QPointer>
#include <algorithm>
#include <array>
#include <cmath>
#include <map>
#include <unordered_map>
#include <vector>

#include "toolkit/qt/strings.hpp"

namespace qz::toolkit::qt {

namespace {

struct ClassicFamily {
  std::string_view name;
  bool fixedPitch;
  std::array<const char*, 3> standIns;
};

constexpr ClassicFamily classicFamilies[] = {
    {"Times", false, {"Liberation Serif", "Tinos", "DejaVu Serif"}},
    {"Times New Roman", false, {"Liberation Serif", "Tinos", "DejaVu Serif"}},
    {"Helvetica", false, {"Liberation Sans", "Arimo", "DejaVu Sans"}},
    {"Arial", false, {"Liberation Sans", "Arimo", "DejaVu Sans"}},
    {"Courier", true, {"Liberation Mono", "Cousine", "DejaVu Sans Mono"}},
    {"Courier New", true, {"Liberation Mono", "Cousine", "DejaVu Sans Mono"}},
    {"Georgia", false, {"Gelasio", "DejaVu Serif", "Liberation Serif"}},
    {"Verdana", false, {"DejaVu Sans", "Bitstream Vera Sans", "Liberation Sans"}},
};

std::vector<FontFamily> familiesOf(const QStringList& desktop) {
  std::vector<FontFamily> families;
  for (const ClassicFamily& classic : classicFamilies) {
    families.push_back({std::string(classic.name), classic.fixedPitch});
  }
  for (const QString& name : desktop) {
    const bool known = std::any_of(families.begin(), families.end(), [&](const FontFamily& family) {
      return family.name == utf8(name);
    });
    if (!known) families.push_back({utf8(name), false});
  }
  return families;
}

/// Returns the family to draw `name` with.
QString standInFor(std::string_view name) {
  QString wanted = qString(name);
  if (QFontDatabase::hasFamily(wanted)) return wanted;
  for (const ClassicFamily& classic : classicFamilies) {
    if (classic.name != name) continue;
    for (const char* standIn : classic.standIns) {
      if (QFontDatabase::hasFamily(QLatin1String(standIn))) return QLatin1String(standIn);
    }
  }
  return wanted;
}

/// Caches the desktop's answers, each of which can take longer than a whole command list.
class Desktop final : public QObject {
 public:
  struct Family {
    QString drawnWith;
    bool fixedPitch;
  };

  /// Returns the application's object, which ends with the application.
  static Desktop& ofApplication() {
    static QPointer<Desktop> desktop;
    if (!desktop) desktop = new Desktop(*qGuiApp);
    return *desktop;
  }

  /// Returns the font of that name, in any spelling that the desktop accepts, at the default size.
  std::optional<Font> fontNamed(std::string_view name) {
    const auto known = named_.find(name);
    if (known != named_.end()) return known->second;
    if (families_.empty()) families_ = familiesOf(QFontDatabase::families());
    auto font = toolkit::fontNamed(name, 0, families_);
    if (!font) return std::nullopt;
    if (!font->fixedPitch) font->fixedPitch = family(font->family).fixedPitch;
    return named_.emplace(name, *std::move(font)).first->second;
  }
  const Family& family(const std::string& name) {
    const auto known = asked_.find(name);
    if (known != asked_.end()) return known->second;
    const QString drawn = standInFor(name);
    return asked_.emplace(name, Family{drawn, QFontDatabase::isFixedPitch(drawn)}).first->second;
  }

 private:
  explicit Desktop(QGuiApplication& application) : QObject(&application) {
    connect(&application, &QGuiApplication::fontDatabaseChanged, this, [this] {
      families_.clear();
      asked_.clear();
      named_.clear();
    });
  }

  std::vector<FontFamily> families_;
  std::unordered_map<std::string, Family> asked_;
  std::map<std::string, Font, std::less<>> named_;
};

}  // namespace

std::optional<Font> QtFonts::fontWithName(std::string_view name, double size) const {
  auto font = Desktop::ofApplication().fontNamed(name);
  if (font && size > 0) font->size = size;
  return font;
}

QString drawnFamily(const Font& font) {
  return Desktop::ofApplication().family(font.family).drawnWith;
}

int pixelSize(const Font& font) { return std::max(1, static_cast<int>(std::lround(font.size))); }

QFont qFont(const Font& font) {
  QFont drawn(drawnFamily(font));
  drawn.setPixelSize(pixelSize(font));
  drawn.setBold(font.bold);
  drawn.setItalic(font.italic);
  drawn.setFixedPitch(font.fixedPitch);
  if (font.fixedPitch) drawn.setStyleHint(QFont::TypeWriter);
  return drawn;
}

}  // namespace qz::toolkit::qt
