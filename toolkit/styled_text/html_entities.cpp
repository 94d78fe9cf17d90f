// SPDX-License-Identifier: MIT
// The entities of HTML 4, and how references are read.
#include "toolkit/styled_text/html_entities.hpp"

#include <algorithm>
#include <array>
#include <cstdint>

#include "text/utf8.hpp"
#include "toolkit/styled_text/html_words.hpp"

namespace qz::toolkit::html {
namespace {

struct Entity {
  std::string_view name;
  char32_t character;
};

// HTML 4.01, chapter 24, in the byte order of the names.
// clang-format off
constexpr auto entities = std::to_array<Entity>({
  {"AElig", 198}, {"Aacute", 193}, {"Acirc", 194}, {"Agrave", 192}, {"Alpha", 913},
  {"Aring", 197}, {"Atilde", 195}, {"Auml", 196}, {"Beta", 914}, {"Ccedil", 199}, {"Chi", 935},
  {"Dagger", 8225}, {"Delta", 916}, {"ETH", 208}, {"Eacute", 201}, {"Ecirc", 202},
  {"Egrave", 200}, {"Epsilon", 917}, {"Eta", 919}, {"Euml", 203}, {"Gamma", 915}, {"Iacute", 205},
  {"Icirc", 206}, {"Igrave", 204}, {"Iota", 921}, {"Iuml", 207}, {"Kappa", 922}, {"Lambda", 923},
  {"Mu", 924}, {"Ntilde", 209}, {"Nu", 925}, {"OElig", 338}, {"Oacute", 211}, {"Ocirc", 212},
  {"Ograve", 210}, {"Omega", 937}, {"Omicron", 927}, {"Oslash", 216}, {"Otilde", 213},
  {"Ouml", 214}, {"Phi", 934}, {"Pi", 928}, {"Prime", 8243}, {"Psi", 936}, {"Rho", 929},
  {"Scaron", 352}, {"Sigma", 931}, {"THORN", 222}, {"Tau", 932}, {"Theta", 920}, {"Uacute", 218},
  {"Ucirc", 219}, {"Ugrave", 217}, {"Upsilon", 933}, {"Uuml", 220}, {"Xi", 926}, {"Yacute", 221},
  {"Yuml", 376}, {"Zeta", 918}, {"aacute", 225}, {"acirc", 226}, {"acute", 180}, {"aelig", 230},
  {"agrave", 224}, {"alefsym", 8501}, {"alpha", 945}, {"amp", 38}, {"and", 8743}, {"ang", 8736},
  {"aring", 229}, {"asymp", 8776}, {"atilde", 227}, {"auml", 228}, {"bdquo", 8222}, {"beta", 946},
  {"brvbar", 166}, {"bull", 8226}, {"cap", 8745}, {"ccedil", 231}, {"cedil", 184}, {"cent", 162},
  {"chi", 967}, {"circ", 710}, {"clubs", 9827}, {"cong", 8773}, {"copy", 169}, {"crarr", 8629},
  {"cup", 8746}, {"curren", 164}, {"dArr", 8659}, {"dagger", 8224}, {"darr", 8595}, {"deg", 176},
  {"delta", 948}, {"diams", 9830}, {"divide", 247}, {"eacute", 233}, {"ecirc", 234},
  {"egrave", 232}, {"empty", 8709}, {"emsp", 8195}, {"ensp", 8194}, {"epsilon", 949},
  {"equiv", 8801}, {"eta", 951}, {"eth", 240}, {"euml", 235}, {"euro", 8364}, {"exist", 8707},
  {"fnof", 402}, {"forall", 8704}, {"frac12", 189}, {"frac14", 188}, {"frac34", 190},
  {"frasl", 8260}, {"gamma", 947}, {"ge", 8805}, {"gt", 62}, {"hArr", 8660}, {"harr", 8596},
  {"hearts", 9829}, {"hellip", 8230}, {"iacute", 237}, {"icirc", 238}, {"iexcl", 161},
  {"igrave", 236}, {"image", 8465}, {"infin", 8734}, {"int", 8747}, {"iota", 953},
  {"iquest", 191}, {"isin", 8712}, {"iuml", 239}, {"kappa", 954}, {"lArr", 8656}, {"lambda", 955},
  {"lang", 9001}, {"laquo", 171}, {"larr", 8592}, {"lceil", 8968}, {"ldquo", 8220}, {"le", 8804},
  {"lfloor", 8970}, {"lowast", 8727}, {"loz", 9674}, {"lrm", 8206}, {"lsaquo", 8249},
  {"lsquo", 8216}, {"lt", 60}, {"macr", 175}, {"mdash", 8212}, {"micro", 181}, {"middot", 183},
  {"minus", 8722}, {"mu", 956}, {"nabla", 8711}, {"nbsp", 160}, {"ndash", 8211}, {"ne", 8800},
  {"ni", 8715}, {"not", 172}, {"notin", 8713}, {"nsub", 8836}, {"ntilde", 241}, {"nu", 957},
  {"oacute", 243}, {"ocirc", 244}, {"oelig", 339}, {"ograve", 242}, {"oline", 8254},
  {"omega", 969}, {"omicron", 959}, {"oplus", 8853}, {"or", 8744}, {"ordf", 170}, {"ordm", 186},
  {"oslash", 248}, {"otilde", 245}, {"otimes", 8855}, {"ouml", 246}, {"para", 182},
  {"part", 8706}, {"permil", 8240}, {"perp", 8869}, {"phi", 966}, {"pi", 960}, {"piv", 982},
  {"plusmn", 177}, {"pound", 163}, {"prime", 8242}, {"prod", 8719}, {"prop", 8733}, {"psi", 968},
  {"quot", 34}, {"rArr", 8658}, {"radic", 8730}, {"rang", 9002}, {"raquo", 187}, {"rarr", 8594},
  {"rceil", 8969}, {"rdquo", 8221}, {"real", 8476}, {"reg", 174}, {"rfloor", 8971}, {"rho", 961},
  {"rlm", 8207}, {"rsaquo", 8250}, {"rsquo", 8217}, {"sbquo", 8218}, {"scaron", 353},
  {"sdot", 8901}, {"sect", 167}, {"shy", 173}, {"sigma", 963}, {"sigmaf", 962}, {"sim", 8764},
  {"spades", 9824}, {"sub", 8834}, {"sube", 8838}, {"sum", 8721}, {"sup", 8835}, {"sup1", 185},
  {"sup2", 178}, {"sup3", 179}, {"supe", 8839}, {"szlig", 223}, {"tau", 964}, {"there4", 8756},
  {"theta", 952}, {"thetasym", 977}, {"thinsp", 8201}, {"thorn", 254}, {"tilde", 732},
  {"times", 215}, {"trade", 8482}, {"uArr", 8657}, {"uacute", 250}, {"uarr", 8593},
  {"ucirc", 251}, {"ugrave", 249}, {"uml", 168}, {"upsih", 978}, {"upsilon", 965}, {"uuml", 252},
  {"weierp", 8472}, {"xi", 958}, {"yacute", 253}, {"yen", 165}, {"yuml", 255}, {"zeta", 950},
  {"zwj", 8205}, {"zwnj", 8204}});
// clang-format on
constexpr std::size_t longestName = 8;

static_assert(entities.size() == 252);
static_assert(std::is_sorted(entities.begin(), entities.end(),
                             [](const Entity& a, const Entity& b) { return a.name < b.name; }));

// The characters of Windows-1252 where Latin-1 has control characters. Its five gaps keep theirs.
constexpr std::array<char32_t, 32> windows1252 = {
    0x20AC, 0x81,   0x201A, 0x0192, 0x201E, 0x2026, 0x2020, 0x2021, 0x02C6, 0x2030, 0x0160,
    0x2039, 0x0152, 0x8D,   0x017D, 0x8F,   0x90,   0x2018, 0x2019, 0x201C, 0x201D, 0x2022,
    0x2013, 0x2014, 0x02DC, 0x2122, 0x0161, 0x203A, 0x0153, 0x9D,   0x017E, 0x0178};

char32_t fromWindows1252(char32_t code) {
  return code >= 0x80 && code < 0xA0 ? windows1252[code - 0x80] : code;
}

std::optional<char32_t> entityNamed(std::string_view name) {
  const Entity* const end = entities.data() + entities.size();
  const Entity* const found = std::lower_bound(
      entities.data(), end, name,
      [](const Entity& entity, std::string_view key) { return entity.name < key; });
  if (found == end || found->name != name) return std::nullopt;
  return found->character;
}

bool isAlphanumeric(char c) { return isLetter(c) || text::isDigit(c); }

/// Returns the value of a digit; absent if `c` is not a digit in that base.
std::optional<unsigned> digitValue(char c, unsigned base) {
  if (text::isDigit(c)) return static_cast<unsigned>(c - '0');
  if (base == 16 && text::lowered(c) >= 'a' && text::lowered(c) <= 'f') {
    return static_cast<unsigned>(text::lowered(c) - 'a' + 10);
  }
  return std::nullopt;
}

char32_t characterNumbered(std::uint32_t number) {
  const bool none = number == 0 || number > 0x10FFFF || (number >= 0xD800 && number <= 0xDFFF);
  return none ? 0xFFFD : fromWindows1252(number);
}

std::optional<Reference> readNumeric(std::string_view bytes) {
  std::size_t at = 2;
  const bool hexadecimal = bytes.size() > at && text::lowered(bytes[at]) == 'x';
  const unsigned base = hexadecimal ? 16 : 10;
  if (hexadecimal) ++at;
  const std::size_t digits = at;
  std::uint32_t number = 0;
  for (; at < bytes.size(); ++at) {
    const auto digit = digitValue(bytes[at], base);
    if (!digit) break;
    // Stops beyond Unicode, so that any number of digits cannot overflow.
    if (number <= 0x10FFFF) number = number * base + *digit;
  }
  if (at == digits) return std::nullopt;
  if (at < bytes.size() && bytes[at] == ';') ++at;
  return Reference{characterNumbered(number), at};
}

/// Returns the longest Latin-1 entity at the start of `name`; in an attribute it must be all of
/// `name`.
std::optional<Reference> readUnterminated(std::string_view name, ReferencePlace place) {
  constexpr std::size_t shortest = 2;
  const std::size_t least =
      place == ReferencePlace::attribute ? std::max(name.size(), shortest) : shortest;
  for (std::size_t length = std::min(name.size(), longestName); length >= least; --length) {
    const auto character = entityNamed(name.substr(0, length));
    if (character && *character <= 0xFF) return Reference{*character, length + 1};
  }
  return std::nullopt;
}

std::optional<Reference> readNamed(std::string_view bytes, ReferencePlace place) {
  std::size_t end = 1;
  while (end < bytes.size() && isAlphanumeric(bytes[end])) ++end;
  const std::string_view name = bytes.substr(1, end - 1);
  const char next = end < bytes.size() ? bytes[end] : '\0';
  if (next == ';') {
    const auto character = entityNamed(name);
    return character ? std::optional(Reference{*character, end + 1}) : std::nullopt;
  }
  if (place == ReferencePlace::attribute && next == '=') return std::nullopt;
  return readUnterminated(name, place);
}

bool standsForItself(char c) {
  return c != '&' && c != '\0' && static_cast<unsigned char>(c) < 0x80;
}

}  // namespace

std::optional<Reference> readReference(std::string_view bytes, ReferencePlace place) {
  const bool numeric = bytes.size() > 1 && bytes[1] == '#';
  return numeric ? readNumeric(bytes) : readNamed(bytes, place);
}

std::string decoded(std::string_view bytes, ReferencePlace place) {
  std::string text;
  text.reserve(bytes.size());
  while (!bytes.empty()) {
    const char c = bytes.front();
    std::size_t length = 1;
    if (standsForItself(c)) {
      text += c;
    } else if (c != '&') {
      if (c != '\0') text::appendUtf8(text, fromWindows1252(static_cast<unsigned char>(c)));
    } else if (const auto reference = readReference(bytes, place)) {
      text::appendUtf8(text, reference->character);
      length = reference->length;
    } else {
      text += '&';
    }
    bytes.remove_prefix(length);
  }
  return text;
}

bool isPlain(std::string_view bytes) {
  return std::all_of(bytes.begin(), bytes.end(), standsForItself);
}

}  // namespace qz::toolkit::html
