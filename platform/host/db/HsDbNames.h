// Names of dictionary entries and symbol table records: compared without regard to case.
#pragma once

#include <string>
#include <string_view>

// Only A to Z fold, as in the classic locale, so that a comparison never depends on the process's
// locale: "Layer" and "LAYER" are one name, "Fläche" and "FLÄCHE" are two.
std::wstring hsdbFoldName(std::wstring_view name);
bool hsdbNamesEqual(std::wstring_view a, std::wstring_view b);
