#pragma once

namespace standins {

/// PostScript to be run before a document's: it gives each TrueType font a name of its own.
/// Ghostscript takes fonts with the same name for one font. Of a document that brings its letters
/// in several fonts, as programs do that send no more than 256 letters in one, it would make
/// pictures of the letters that the first does not have.
constexpr const char* KeepFontsApart = R"(
userdict begin
/QuillonFonts 50 dict def % the names that are taken, with the data of their fonts
/QuillonName { % font -> font, renamed if its name is taken
  dup /FontName get QuillonFonts 1 index known {
    QuillonFonts 1 index get 2 index /sfnts get ne {
      QuillonFonts length 12 string cvs exch 200 string cvs
      dup length 2 index length add 1 add string
      dup 0 3 index putinterval
      dup 2 index length 45 put
      dup 3 -1 roll length 1 add 4 -1 roll putinterval
      cvn 1 index exch /FontName exch put
    } { pop } ifelse
  } { pop } ifelse
  QuillonFonts 1 index dup /FontName get exch /sfnts get put
} bind def
/definefont {
  dup type /dicttype eq {
    dup wcheck 1 index /sfnts known and 1 index /FontName known and { QuillonName } if
  } if
  systemdict /definefont get exec
} bind def
end
)";

} // namespace standins
