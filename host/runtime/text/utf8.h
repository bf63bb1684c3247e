// Text with character semantics over UTF-8.
//
// Every text that enters the host goes through to_valid_utf8() once, so the
// rest of the host can assume valid UTF-8. Positions are 1-based character
// positions, as the host's programs count them; 0 means "absent".
#pragma once

#include <cstddef>
#include <string>
#include <string_view>

namespace host::text {

/// True when s is well-formed UTF-8 (no overlong forms, no surrogates, <= U+10FFFF).
bool is_valid_utf8(std::string_view s);

/// s made valid: well-formed sequences are kept, and every byte of an invalid
/// sequence is decoded as Windows-1252 (the legacy encoding of French text files).
std::string to_valid_utf8(std::string_view s);

/// The whole of s decoded as Windows-1252.
std::string from_windows1252(std::string_view s);

/// Number of characters (code points) of valid UTF-8 text.
std::size_t length(std::string_view s);

/// Byte offset of character index `chars` (0-based); s.size() when past the end.
std::size_t byte_offset(std::string_view s, std::size_t chars);

/// Characters start..end (1-based, inclusive); end 0 means "to the end".
/// Out-of-range bounds are clipped; an end before the start gives "".
std::string substring(std::string_view s, long start, long end = 0);

/// 1-based character position of the first needle at or after character `from`, 0 when absent.
std::size_t position(std::string_view s, std::string_view needle, std::size_t from = 1);

/// 1-based character position of the last needle, 0 when absent.
std::size_t last_position(std::string_view s, std::string_view needle);

/// The last n characters (the whole text when shorter).
std::string right(std::string_view s, std::size_t n);

/// Upper or lower case, correct for ASCII, Latin-1 and Latin Extended-A ("é" <-> "É", "œ" <-> "Œ").
std::string upper(std::string_view s);
std::string lower(std::string_view s);

/// Case-insensitive equality (by upper()).
bool iequals(std::string_view a, std::string_view b);

/// Appends code point cp encoded as UTF-8.
void append_utf8(std::string& out, char32_t cp);

}  // namespace host::text
