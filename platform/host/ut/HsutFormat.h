// printf-style formatting of wide text, the same under every process locale.
//
// The host's conventions for a wide format: "%s" and "%ls" take a const wchar_t*, "%S" and "%hs"
// take a UTF-8 const char*; "%c" takes a wchar_t, "%C" and "%hc" a narrow char. Integers
// (d i u o x X with hh h l ll z j t), floating point (f F e E g G) and "%p" follow C, with
// flags "-+ #0", width and precision (also as "*"). Numbers never take the locale's decimal
// comma. "%n" is refused (it prints nothing and stores nothing); an unknown conversion is copied
// through as it stands, so a wrong format shows in the output instead of crashing.
#pragma once

#include <cstdarg>
#include <string>

std::wstring hsutVFormat(const wchar_t* format, va_list args);
std::wstring hsutFormat(const wchar_t* format, ...);
