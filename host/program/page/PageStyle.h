#pragma once

/// How the page looks: light or dark, as its reader's system is, and on narrow screens too.
extern const char* const PageStyle;

/// Keeps the page up to date, and what its reader has in hand as it is: focus, place, marked text.
extern const char* const PageScript;
