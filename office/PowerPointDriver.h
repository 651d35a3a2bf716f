#pragma once

#include "plugin/interface/ProgressSink.h"
#include "plugin/interface/ResultCodes.h"
#include "plugin/settings/PowerPointOptions.h"

#include <wx/string.h>

/// Prints a presentation into a PostScript file through PowerPoint.
/// @param inputPath the presentation's full path
/// @param outputFolder where the PostScript file goes; no separator at its end
/// @param psFileName receives that file's name, whatever the result, unless `inputPath` is empty
/// @param progress receives the presentation's base name and a percentage; may be null
/// @param printer the user's printer, used when there is no Distiller printer; not null
/// @param options how to print; not null
/// @return 0, -1002, -1010, 1013, 1017, 1020, 1021 or 1022
ResultCode PrintPowerPointPresentation(const wxString& inputPath, const wxString& outputFolder,
                                       wxString& psFileName, ProgressSink* progress,
                                       const wxString* printer, const PowerPointOptions* options);
