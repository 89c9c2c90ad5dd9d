// Conversions between the host's wide text (one code point per character) and UTF-8.
#pragma once

#include <string>
#include <string_view>

// Code points that UTF-8 cannot carry (surrogates, values past U+10FFFF) become U+FFFD.
std::string hsutToUtf8(std::wstring_view text);

// Malformed or truncated sequences become U+FFFD, one per offending byte; nothing is skipped silently.
std::wstring hsutFromUtf8(std::string_view text);
