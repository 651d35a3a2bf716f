#include "pstools/PS2PDF.h"

#include "common/LoadedModule.h"
#include "common/WQServices.h"
#include "machine/FiltersFolder.h"
#include "pstools/DistillerBridge.h"
#include "pstools/DistillerDiscovery.h"

#include <objbase.h>

#include <wx/filename.h>
#include <wx/strconv.h>

#include <cstring>
#include <string>

namespace {

/// COM on the calling thread, for what the bridge may do with it.
class ComForBridge {
public:
    ComForBridge() { CoInitialize(nullptr); }
    ~ComForBridge() { CoUninitialize(); }
    ComForBridge(const ComForBridge&) = delete;
    ComForBridge& operator=(const ComForBridge&) = delete;
};

LoadedModule LoadBridge() {
    wxString folder;
    GetFiltersFolder(folder);
    return LoadedModule(folder + wxFileName::GetPathSeparator() + DistillerBridgeFile);
}

std::u16string Utf16(const wxString& text) {
    const wxScopedCharBuffer bytes = text.mb_str(wxMBConvUTF16LE());
    std::u16string units(bytes.length() / sizeof(char16_t), u'\0');
    std::memcpy(units.data(), bytes.data(), units.size() * sizeof(char16_t));
    return units;
}

bool RunBridge(DistConvertFile* convert, const DistillerRequest& request, const wxString& psPath) {
    SetLevelAndGetLogger(LevelInformation, __FILE__, "ConvertPS2PDF", __LINE__)
        << "Before Calling DIST_convertFile for " << psPath;
    const std::int32_t result = convert(&request);
    SetLevelAndGetLogger(LevelInformation, __FILE__, "ConvertPS2PDF", __LINE__)
        << "After Calling DIST_convertFile for " << psPath;
    return result == 0;
}

} // namespace

// NOLINTNEXTLINE(performance-unnecessary-value-param)
bool ConvertPS2PDF(wxString psPath, wxString pdfPath, const wchar_t* profile) {
    const LoadedModule bridge = LoadBridge();
    if (!bridge)
        return false;
    auto* convert = bridge.Find<DistConvertFile>(DistillerBridgeExport);
    if (!convert)
        return false;

    const std::u16string psPathUnits = Utf16(psPath);
    const std::u16string pdfPathUnits = Utf16(pdfPath);
    const std::u16string profileUnits = Utf16(profile);
    const DistillerRequest request{psPathUnits.c_str(), pdfPathUnits.c_str(), profileUnits.c_str()};
    const ComForBridge com;
    try {
        return RunBridge(convert, request, psPath);
    } catch (...) { // the bridge is not ours: whatever leaves it must not leave the filter
        return false;
    }
}
