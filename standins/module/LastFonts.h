#pragma once

#include <string>

namespace standins {

/// Under HKEY_CURRENT_USER the fonts that others stood in for in the documents opened last: in the
/// value "Fonts", for each a line with the font asked for, the one used, and "metric" when it runs
/// alike, with tabs between. Applications answer their client nothing of the kind; the host finds
/// it here, and takes the key away before it has a filter do anything.
constexpr const wchar_t* LastFontsKey = L"SOFTWARE\\Orvanta\\Stand-Ins\\Last Fonts";
constexpr const wchar_t* FontsValue = L"Fonts";

/// Adds fonts to those that are left there. Those are left out that are installed, under another
/// name.
/// @param standIns for each a line with the font asked for, a tab and the one used; UTF-8
void LeaveFonts(const std::string& standIns);

} // namespace standins
