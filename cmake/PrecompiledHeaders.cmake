# Headers that most sources need, compiled once for all of those compiled the same way. Sources still
# include all that they use: the linter reads them without.

set(standard_headers
    <algorithm> <chrono> <cstdint> <filesystem> <fstream> <functional> <map> <memory> <optional>
    <set> <sstream> <string> <string_view> <utility> <vector>)

# The Windows API comes first: the toolkit undoes some of its macros.
set(toolkit_headers
    <wx/msw/wrapwin.h> <wx/arrstr.h> <wx/choice.h> <wx/filename.h> <wx/intl.h> <wx/msgdlg.h>
    <wx/msw/registry.h> <wx/panel.h> <wx/sizer.h> <wx/stattext.h> <wx/string.h> <wx/utils.h>
    <wx/window.h> <wx/xml/xml.h>)

set(test_headers <gmock/gmock.h> <gtest/gtest.h>)

option(QUILLON_PRECOMPILED_HEADERS "Compile what most sources include once" ON)

# precompile_headers(TARGET HEADER…)
function(precompile_headers target)
    if(QUILLON_PRECOMPILED_HEADERS)
        target_precompile_headers(${target} PRIVATE ${ARGN})
    endif()
endfunction()

# Takes the headers of another target, which is compiled the same way.
function(reuse_headers target from)
    if(QUILLON_PRECOMPILED_HEADERS)
        target_precompile_headers(${target} REUSE_FROM ${from})
    endif()
endfunction()
