#include "host/runtime/text/utf8.h"

#include <array>

namespace host::text {
namespace {

// Windows-1252 code points of bytes 0x80..0x9F; the five undefined bytes map to
// their C1 control code point, as most decoders do.
constexpr std::array<char32_t, 32> kCp1252High = {
    0x20AC, 0x0081, 0x201A, 0x0192, 0x201E, 0x2026, 0x2020, 0x2021,
    0x02C6, 0x2030, 0x0160, 0x2039, 0x0152, 0x008D, 0x017D, 0x008F,
    0x0090, 0x2018, 0x2019, 0x201C, 0x201D, 0x2022, 0x2013, 0x2014,
    0x02DC, 0x2122, 0x0161, 0x203A, 0x0153, 0x009D, 0x017E, 0x0178};

char32_t cp1252(unsigned char b) {
  if (b >= 0x80 && b <= 0x9F) return kCp1252High[b - 0x80];
  return b;
}

// Length of the well-formed sequence starting at s[i], 0 when it is not one.
std::size_t sequence_length(std::string_view s, std::size_t i) {
  auto b = [&](std::size_t k) { return static_cast<unsigned char>(s[i + k]); };
  unsigned char c = b(0);
  std::size_t left = s.size() - i;
  if (c < 0x80) return 1;
  auto cont = [&](std::size_t k) { return k < left && (b(k) & 0xC0) == 0x80; };
  if (c >= 0xC2 && c <= 0xDF) return cont(1) ? 2 : 0;
  if (c >= 0xE0 && c <= 0xEF) {
    if (!cont(1) || !cont(2)) return 0;
    if (c == 0xE0 && b(1) < 0xA0) return 0;   // overlong
    if (c == 0xED && b(1) > 0x9F) return 0;   // surrogate
    return 3;
  }
  if (c >= 0xF0 && c <= 0xF4) {
    if (!cont(1) || !cont(2) || !cont(3)) return 0;
    if (c == 0xF0 && b(1) < 0x90) return 0;   // overlong
    if (c == 0xF4 && b(1) > 0x8F) return 0;   // above U+10FFFF
    return 4;
  }
  return 0;
}

char32_t decode_at(std::string_view s, std::size_t i, std::size_t n) {
  auto b = [&](std::size_t k) { return static_cast<char32_t>(static_cast<unsigned char>(s[i + k])); };
  switch (n) {
    case 1: return b(0);
    case 2: return ((b(0) & 0x1F) << 6) | (b(1) & 0x3F);
    case 3: return ((b(0) & 0x0F) << 12) | ((b(1) & 0x3F) << 6) | (b(2) & 0x3F);
    default: return ((b(0) & 0x07) << 18) | ((b(1) & 0x3F) << 12) | ((b(2) & 0x3F) << 6) | (b(3) & 0x3F);
  }
}

std::size_t lead_length(unsigned char c) {
  if (c < 0x80) return 1;
  if (c >= 0xF0) return 4;
  if (c >= 0xE0) return 3;
  if (c >= 0xC0) return 2;
  return 1;
}

char32_t to_upper(char32_t c) {
  if (c >= 'a' && c <= 'z') return c - 32;
  if (c < 0x80) return c;
  if ((c >= 0xE0 && c <= 0xFE && c != 0xF7)) return c - 32;
  if (c == 0xFF) return 0x178;
  if (c == 0xB5) return c;  // micro sign keeps its form
  if (c >= 0x100 && c <= 0x17F) {
    if (c == 0x131) return 'I';
    if (c == 0x130 || c == 0x138 || c == 0x149 || c == 0x17F) return c;
    bool odd_upper = (c >= 0x139 && c <= 0x148) || (c >= 0x179 && c <= 0x17E);
    if (odd_upper) return (c % 2 == 0) ? c - 1 : c;
    return (c % 2 == 1) ? c - 1 : c;
  }
  return c;
}

char32_t to_lower(char32_t c) {
  if (c >= 'A' && c <= 'Z') return c + 32;
  if (c < 0x80) return c;
  if (c >= 0xC0 && c <= 0xDE && c != 0xD7) return c + 32;
  if (c == 0x178) return 0xFF;
  if (c >= 0x100 && c <= 0x17F) {
    if (c == 0x130) return 'i';
    if (c == 0x131 || c == 0x138 || c == 0x149 || c == 0x17F) return c;
    bool odd_upper = (c >= 0x139 && c <= 0x148) || (c >= 0x179 && c <= 0x17E);
    if (odd_upper) return (c % 2 == 1) ? c + 1 : c;
    return (c % 2 == 0) ? c + 1 : c;
  }
  return c;
}

template <class Map>
std::string map_chars(std::string_view s, Map map) {
  std::string out;
  out.reserve(s.size());
  for (std::size_t i = 0; i < s.size();) {
    std::size_t n = sequence_length(s, i);
    if (n == 0) {  // not expected on valid text: keep the byte's Windows-1252 reading
      append_utf8(out, map(cp1252(static_cast<unsigned char>(s[i]))));
      ++i;
      continue;
    }
    if (n == 1) {
      out.push_back(static_cast<char>(map(static_cast<unsigned char>(s[i]))));
    } else {
      append_utf8(out, map(decode_at(s, i, n)));
    }
    i += n;
  }
  return out;
}

}  // namespace

void append_utf8(std::string& out, char32_t cp) {
  if (cp < 0x80) {
    out.push_back(static_cast<char>(cp));
  } else if (cp < 0x800) {
    out.push_back(static_cast<char>(0xC0 | (cp >> 6)));
    out.push_back(static_cast<char>(0x80 | (cp & 0x3F)));
  } else if (cp < 0x10000) {
    out.push_back(static_cast<char>(0xE0 | (cp >> 12)));
    out.push_back(static_cast<char>(0x80 | ((cp >> 6) & 0x3F)));
    out.push_back(static_cast<char>(0x80 | (cp & 0x3F)));
  } else {
    out.push_back(static_cast<char>(0xF0 | (cp >> 18)));
    out.push_back(static_cast<char>(0x80 | ((cp >> 12) & 0x3F)));
    out.push_back(static_cast<char>(0x80 | ((cp >> 6) & 0x3F)));
    out.push_back(static_cast<char>(0x80 | (cp & 0x3F)));
  }
}

bool is_valid_utf8(std::string_view s) {
  for (std::size_t i = 0; i < s.size();) {
    if (static_cast<unsigned char>(s[i]) < 0x80) { ++i; continue; }
    std::size_t n = sequence_length(s, i);
    if (n == 0) return false;
    i += n;
  }
  return true;
}

std::string to_valid_utf8(std::string_view s) {
  if (is_valid_utf8(s)) return std::string(s);
  std::string out;
  out.reserve(s.size() + s.size() / 4);
  for (std::size_t i = 0; i < s.size();) {
    std::size_t n = sequence_length(s, i);
    if (n == 0) {
      append_utf8(out, cp1252(static_cast<unsigned char>(s[i])));
      ++i;
    } else {
      out.append(s.substr(i, n));
      i += n;
    }
  }
  return out;
}

std::string from_windows1252(std::string_view s) {
  std::string out;
  out.reserve(s.size() + s.size() / 4);
  for (unsigned char b : s) append_utf8(out, cp1252(b));
  return out;
}

std::size_t length(std::string_view s) {
  std::size_t n = 0;
  for (unsigned char c : s) n += (c & 0xC0) != 0x80;
  return n;
}

std::size_t byte_offset(std::string_view s, std::size_t chars) {
  std::size_t i = 0;
  while (chars > 0 && i < s.size()) {
    i += lead_length(static_cast<unsigned char>(s[i]));
    --chars;
  }
  return i < s.size() ? i : s.size();
}

std::string substring(std::string_view s, long start, long end) {
  if (start < 1) start = 1;
  std::size_t from = byte_offset(s, static_cast<std::size_t>(start - 1));
  if (from >= s.size()) return {};
  if (end == 0) return std::string(s.substr(from));
  if (end < start) return {};
  std::string_view rest = s.substr(from);
  std::size_t to = byte_offset(rest, static_cast<std::size_t>(end - start + 1));
  return std::string(rest.substr(0, to));
}

std::size_t position(std::string_view s, std::string_view needle, std::size_t from) {
  if (needle.empty()) return 0;
  if (from < 1) from = 1;
  std::size_t start = byte_offset(s, from - 1);
  std::size_t hit = s.find(needle, start);
  if (hit == std::string_view::npos) return 0;
  return length(s.substr(0, hit)) + 1;
}

std::size_t last_position(std::string_view s, std::string_view needle) {
  if (needle.empty()) return 0;
  std::size_t hit = s.rfind(needle);
  if (hit == std::string_view::npos) return 0;
  return length(s.substr(0, hit)) + 1;
}

std::string right(std::string_view s, std::size_t n) {
  std::size_t len = length(s);
  if (n >= len) return std::string(s);
  return std::string(s.substr(byte_offset(s, len - n)));
}

std::string upper(std::string_view s) { return map_chars(s, to_upper); }
std::string lower(std::string_view s) { return map_chars(s, to_lower); }

bool iequals(std::string_view a, std::string_view b) {
  bool ascii = true;
  if (a.size() == b.size()) {
    for (std::size_t i = 0; i < a.size(); ++i) {
      unsigned char x = a[i], y = b[i];
      if (x >= 0x80 || y >= 0x80) { ascii = false; break; }
      if (x >= 'a' && x <= 'z') x -= 32;
      if (y >= 'a' && y <= 'z') y -= 32;
      if (x != y) return false;
    }
    if (ascii) return true;
  }
  return upper(a) == upper(b);
}

}  // namespace host::text
