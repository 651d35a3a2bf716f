#pragma once

#include "plugin/interface/ProgressSink.h"
#include "plugin/interface/ResultCodes.h"

#include <wx/string.h>

/// Prints an Excel workbook into a PostScript file through Excel.
/// @param inputPath the workbook's full path
/// @param outputFolder where the PostScript file goes; no separator at its end
/// @param psFileName receives that file's name, whatever the result, unless `inputPath` is empty
/// @param progress receives the workbook's base name and a percentage; may be null
/// @param printer the user's printer, used when there is no Distiller printer; not null
/// @return 0, -1002, -1010, 1014, 1018, 1020, 1021 or 1022
ResultCode PrintExcelWorkbook(const wxString& inputPath, const wxString& outputFolder,
                              wxString& psFileName, ProgressSink* progress,
                              const wxString* printer);
