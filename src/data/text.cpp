#include "data/text.h"

#include <algorithm>
#include <array>
#include <compare>
#include <cstdint>
#include <utility>

namespace marlowbeck {
namespace {

/// Unicode of the bytes 0x80 to 0x9F of code page 1252.
constexpr std::array<std::uint16_t, 32> kUpperControls = {
    0x20AC, 0x0081, 0x201A, 0x0192, 0x201E, 0x2026, 0x2020, 0x2021, 0x02C6, 0x2030, 0x0160,
    0x2039, 0x0152, 0x008D, 0x017D, 0x008F, 0x0090, 0x2018, 0x2019, 0x201C, 0x201D, 0x2022,
    0x2013, 0x2014, 0x02DC, 0x2122, 0x0161, 0x203A, 0x0153, 0x009D, 0x017E, 0x0178};

constexpr std::uint32_t kNoCharacter = 0xFFFFFFFF;

constexpr std::uint32_t kLastCharacter = 0x10FFFF;
constexpr std::uint32_t kReplacement = 0xFFFD;

/// What an escape begins with, and the digits behind it. Numbers from kGarbled on stand for a byte
/// that is part of no character.
constexpr char kEscape = '\x81';
constexpr std::string_view kHex = "0123456789ABCDEF";
constexpr std::size_t kEscapeDigits = 6;
constexpr std::uint32_t kGarbled = kLastCharacter + 1;

/// The smallest character that takes so many bytes of UTF-8.
constexpr std::array<std::uint32_t, 5> kSmallest = {0, 0, 0x80, 0x800, 0x10000};

char UpperByte(char character) {
  const auto byte = static_cast<unsigned char>(character);
  if (byte >= 'a' && byte <= 'z') return static_cast<char>(byte - 32);
  if (byte >= 0xE0 && byte <= 0xFE && byte != 0xF7) return static_cast<char>(byte - 32);
  switch (byte) {
    case 0x9A:
    case 0x9C:
    case 0x9E:
      return static_cast<char>(byte - 16);  // s caron, oe, z caron
    case 0xFF:
      return static_cast<char>(0x9F);  // y diaeresis
    default:
      return character;
  }
}

void AppendUtf8(std::string& out, std::uint32_t code) {
  if (code < 0x80) {
    out += static_cast<char>(code);
  } else if (code < 0x800) {
    out += static_cast<char>(0xC0 | (code >> 6));
    out += static_cast<char>(0x80 | (code & 0x3F));
  } else {
    if (code < 0x10000) {
      out += static_cast<char>(0xE0 | (code >> 12));
    } else {
      out += static_cast<char>(0xF0 | (code >> 18));
      out += static_cast<char>(0x80 | ((code >> 12) & 0x3F));
    }
    out += static_cast<char>(0x80 | ((code >> 6) & 0x3F));
    out += static_cast<char>(0x80 | (code & 0x3F));
  }
}

/// How many bytes the character that begins with `lead` takes; 0 for a byte that begins none.
std::size_t Utf8Length(unsigned char lead) {
  if (lead < 0x80) return 1;
  if (lead >= 0xC2 && lead <= 0xDF) return 2;
  if (lead >= 0xE0 && lead <= 0xEF) return 3;
  if (lead >= 0xF0 && lead <= 0xF4) return 4;
  return 0;
}

/// Takes one character off the front of `text`; kNoCharacter, and one byte, where it is garbled.
std::uint32_t TakeCharacter(std::string_view& text) {
  const auto lead = static_cast<unsigned char>(text.front());
  const std::size_t length = Utf8Length(lead);
  std::uint32_t code = length == 1 ? lead : lead & (0xFFU >> (length + 1));
  bool whole = length > 0 && length <= text.size();
  for (std::size_t i = 1; whole && i < length; ++i) {
    const auto byte = static_cast<unsigned char>(text[i]);
    whole = (byte & 0xC0) == 0x80;
    code = (code << 6) | (byte & 0x3FU);
  }
  // A shorter form of the same character would do, or there is none of that number.
  whole = whole && code >= kSmallest[length] && code <= kLastCharacter;
  text.remove_prefix(whole ? length : 1);
  return whole ? code : kNoCharacter;
}

char ByteOf(std::uint32_t code) {
  if (code < 0x80 || (code >= 0xA0 && code <= 0xFF)) return static_cast<char>(code);
  const auto* const place = std::find(kUpperControls.begin(), kUpperControls.end(), code);
  return place == kUpperControls.end() ? '?'
                                       : static_cast<char>(0x80 + (place - kUpperControls.begin()));
}

std::uint32_t CodeOf(char character) {
  const auto byte = static_cast<unsigned char>(character);
  return byte >= 0x80 && byte <= 0x9F ? kUpperControls[byte - 0x80U] : byte;
}

bool IsHexAhead(std::string_view text) {
  const std::string_view digits = text.substr(0, kEscapeDigits);
  return digits.size() == kEscapeDigits && digits.find_first_not_of(kHex) == std::string_view::npos;
}

bool BeginsWithEscape(std::string_view text) {
  return text.front() == kEscape && IsHexAhead(text.substr(1));
}

std::string Escape(std::uint32_t code) {
  std::string escape(1 + kEscapeDigits, kEscape);
  for (std::size_t i = kEscapeDigits; i > 0; --i, code >>= 4) escape[i] = kHex[code & 0xF];
  return escape;
}

std::uint32_t CodeOfEscape(std::string_view escape) {
  std::uint32_t code = 0;
  for (const char digit : escape.substr(1)) {
    code = (code << 4) | static_cast<std::uint32_t>(kHex.find(digit));
  }
  return code;
}

/// UTF-8 holds neither halves of a pair nor bytes that are part of no character.
bool CanBeShown(std::uint32_t code) {
  return code <= kLastCharacter && (code < 0xD800 || code > 0xDFFF);
}

}  // namespace

std::string_view Trimmed(std::string_view text) {
  const auto first = text.find_first_not_of(' ');
  if (first == std::string_view::npos) return {};
  return text.substr(first, text.find_last_not_of(' ') - first + 1);
}

std::string Trim(std::string_view text) { return std::string(Trimmed(text)); }

std::string UpperCase(std::string_view text) {
  std::string result(text);
  std::transform(result.begin(), result.end(), result.begin(), UpperByte);
  return result;
}

bool EqualsIgnoringCase(std::string_view a, std::string_view b) {
  return std::equal(a.begin(), a.end(), b.begin(), b.end(),
                    [](char x, char y) { return UpperByte(x) == UpperByte(y); });
}

bool ComesBefore(std::string_view a, std::string_view b) {
  const auto byte = [](char letter) { return static_cast<unsigned char>(UpperByte(letter)); };
  const auto order = std::lexicographical_compare_three_way(
      a.begin(), a.end(), b.begin(), b.end(), [&](char x, char y) { return byte(x) <=> byte(y); });
  return std::is_eq(order) ? a < b : std::is_lt(order);
}

std::string FixedWidth(std::string_view text, std::size_t width) {
  std::string result(text.substr(0, width));
  result.resize(width, ' ');
  return result;
}

std::string WithoutLast(std::string_view text, std::size_t count) {
  return std::string(text.substr(0, text.size() > count ? text.size() - count : 0));
}

std::string Lines(std::initializer_list<std::string_view> lines) {
  std::string result;
  bool first = true;
  for (const std::string_view line : lines) {
    if (!std::exchange(first, false)) result += '\r';
    result += line;
  }
  return result;
}

std::string Utf8FromCp1252(std::string_view text) {
  std::string result;
  result.reserve(text.size());
  for (const char character : text) AppendUtf8(result, CodeOf(character));
  return result;
}

std::string Cp1252FromUtf8(std::string_view text) {
  std::string result;
  result.reserve(text.size());
  while (!text.empty()) result += ByteOf(TakeCharacter(text));
  return result;
}

std::string TextOfName(std::string_view name) {
  std::string text;
  text.reserve(name.size());
  while (!name.empty()) {
    const auto lead = static_cast<unsigned char>(name.front());
    const std::uint32_t code = TakeCharacter(name);
    const char byte = ByteOf(code);
    if (code == kNoCharacter) {
      text += Escape(kGarbled + lead);
    } else if (CodeOf(byte) != code || (byte == kEscape && IsHexAhead(name))) {
      text += Escape(code);
    } else {
      text += byte;
    }
  }
  return text;
}

std::string NameOfText(std::string_view text) {
  std::string name;
  name.reserve(text.size());
  for (const std::string_view character : CharactersOf(text)) {
    const std::uint32_t code =
        character.size() == 1 ? CodeOf(character.front()) : CodeOfEscape(character);
    if (code > kLastCharacter) {
      name += static_cast<char>(code - kGarbled);
    } else {
      AppendUtf8(name, code);
    }
  }
  return name;
}

std::string ShownText(std::string_view text) {
  if (text.find(kEscape) == std::string_view::npos) return Utf8FromCp1252(text);
  std::string shown;
  for (const std::string_view character : CharactersOf(text)) {
    const std::uint32_t code =
        character.size() == 1 ? CodeOf(character.front()) : CodeOfEscape(character);
    AppendUtf8(shown, CanBeShown(code) ? code : kReplacement);
  }
  return shown;
}

std::string WithoutEscapes(std::string_view text) {
  std::string plain;
  plain.reserve(text.size());
  for (const std::string_view character : CharactersOf(text)) {
    plain += character.size() == 1 ? character.front() : '?';
  }
  return plain;
}

std::vector<std::string_view> CharactersOf(std::string_view text) {
  std::vector<std::string_view> characters;
  characters.reserve(text.size());
  while (!text.empty()) {
    const std::size_t length = BeginsWithEscape(text) ? 1 + kEscapeDigits : 1;
    characters.push_back(text.substr(0, length));
    text.remove_prefix(length);
  }
  return characters;
}

}  // namespace marlowbeck
