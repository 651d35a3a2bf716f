#include "standins/office/printer/ColourProcedures.h"

namespace standins {

namespace {

/// The luminance of each colour. Pictures and shadings keep their data and get a colour space whose
/// three components make one gray.
constexpr const char* Gray = R"(
/QuillonLuminance { 0.114 mul exch 0.587 mul add exch 0.299 mul add } bind def
/QuillonGray [ /DeviceN [ /Red /Green /Blue ] /DeviceGray //QuillonLuminance ] def
/rg { QuillonLuminance setgray } bind def
/setcolorspace {
  dup /DeviceRGB eq { pop QuillonGray } if systemdict /setcolorspace get exec
} bind def
/QuillonGrayShading {
  dup /ColorSpace get /DeviceRGB eq { dup /ColorSpace QuillonGray put } if
} bind def
/makepattern {
  1 index /Shading known { 1 index /Shading get QuillonGrayShading pop } if
  systemdict /makepattern get exec
} bind def
/shfill { QuillonGrayShading systemdict /shfill get exec } bind def
)";

/// As Office has it: text and lines are black, areas are white, and pictures are gray; so are areas
/// that shine through, since they are pictures here. An area that is as narrow as a line or as
/// small as an arrowhead counts as one.
constexpr const char* BlackAndWhite = R"(
/QuillonExtent {
  gsave initmatrix { pathbbox } stopped
    { 0 } { exch 4 -1 roll sub 3 1 roll exch sub 2 copy gt { exch } if pop } ifelse
  grestore
} bind def
/QuillonArea { QuillonExtent 4 gt { 1 } { 0 } ifelse setgray } bind def
/f { QuillonArea fill } bind def
/f* { QuillonArea eofill } bind def
/rectfill { 1 setgray systemdict /rectfill get exec } bind def
/S { 0 setgray stroke } bind def
/QuillonTj /Tj load def
/QuillonTJ /TJ load def
/Tj { 0 setgray QuillonTj } bind def
/TJ { 0 setgray QuillonTJ } bind def
/shfill { pop gsave clippath 1 setgray fill grestore } bind def
)";

} // namespace

std::string ColourProcedures(Colours colours) {
    switch (colours) {
    case Colours::Gray:
        return Gray;
    case Colours::BlackAndWhite:
        return std::string(Gray) + BlackAndWhite;
    case Colours::All:
        break;
    }
    return {};
}

} // namespace standins
