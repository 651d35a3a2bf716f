#include "plugin/MSOfficePluginImpl.h"
#include "plugin/ScreeningRules.h"

#include <wx/dir.h>
#include <wx/filename.h>

#include <memory>
#include <type_traits>

namespace {

/// Whether UTF-8 has a form for every character. wxString's own conversion writes a lone surrogate
/// without complaint, so the units are looked at here; a pair is one character only where wchar_t
/// is a UTF-16 unit.
bool IsRepresentableInUtf8(const wxString& text) {
    constexpr wxUint32 FirstSurrogate = 0xD800;
    constexpr wxUint32 FirstLowSurrogate = 0xDC00;
    constexpr wxUint32 LastSurrogate = 0xDFFF;
    constexpr wxUint32 LastCharacter = 0x10FFFF;
    const auto isLow = [](wxUint32 unit) {
        return unit >= FirstLowSurrogate && unit <= LastSurrogate;
    };

    const std::wstring& units = text.ToStdWstring();
    const auto unitAt = [&units](std::size_t index) {
        return wxUint32{static_cast<std::make_unsigned_t<wchar_t>>(units[index])};
    };
    for (std::size_t i = 0; i < units.size(); ++i) {
        const wxUint32 unit = unitAt(i);
        const bool isPair = sizeof(wchar_t) == 2 && unit >= FirstSurrogate &&
                            unit < FirstLowSurrogate && i + 1 < units.size() &&
                            isLow(unitAt(i + 1));
        if (isPair)
            ++i;
        else if (unit > LastCharacter || (unit >= FirstSurrogate && unit <= LastSurrogate))
            return false;
    }
    return true;
}

} // namespace

int MSOfficePluginImpl::ScreenFiles(const wxArrayString& files, wxArrayString& spare,
                                    wxArrayString& refused, JobItemArray& items) {
    return RunOperation(Result::Failure, [&] {
        spare.Clear();
        for (const wxString& path : files)
            if (ScreenFile(path, refused, items) == Screening::Stop)
                break;
        return m_lastResult;
    });
}

/// Classifies one file and leaves its outcome as the last result. What stands in the way of every
/// later file too, and a list that is broken in itself, end the run.
MSOfficePluginImpl::Screening
MSOfficePluginImpl::ScreenFile(const wxString& path, wxArrayString& refused, JobItemArray& items) {
    const wxFileName name(path);
    const auto refuse = [&](ResultCode code) {
        refused.Add(name.GetFullPath());
        m_lastResult = code;
    };

    if (path.empty()) {
        m_lastResult = Result::InputFileNotFound;
        return Screening::Stop;
    }
    if (!IsRepresentableInUtf8(path)) {
        refuse(Result::InvalidInputFile);
        return Screening::Stop;
    }
    const ScreeningRule* rule = FindScreeningRule(name.GetExt());
    if (!rule) {
        refuse(Result::InvalidInputFile);
        return Screening::GoOn;
    }
    const bool isAdmitted = rule->isVersionSufficient
                                ? rule->isVersionSufficient() && m_printerAvailable
                                : CanConvert();
    if (!isAdmitted) {
        refuse(Result::NotInitialized);
        return Screening::Stop;
    }

    m_lastResult = rule->check(name.GetFullPath());
    if (m_lastResult == Result::Success)
        Accept(name, items);
    return Screening::GoOn;
}

/// Where memory runs out this file gets no item; the others need not suffer for it.
void MSOfficePluginImpl::Accept(const wxFileName& document, JobItemArray& items) {
    CatchAll([&] {
        auto item = std::make_unique<JobItem>();
        GetIdentifier(item->pluginIdentifier);
        item->fileName = document.GetFullName();
        item->paths.Add(document.GetFullPath());
        items.Add(item.get());
        item.release(); // NOLINT(bugprone-unused-return-value): the array has it now
    });
}

int MSOfficePluginImpl::ScreenFolder(const wxString& folder, wxArrayString& refused,
                                     JobItemArray& items) {
    return RunOperation(Result::Failure, [&] {
        wxArrayString files;
        if (wxDir::Exists(folder))
            wxDir::GetAllFiles(folder, &files, wxEmptyString, wxDIR_FILES);
        wxArrayString spare;
        return ScreenFiles(files, spare, refused, items);
    });
}

int MSOfficePluginImpl::ScreenFileList(const wxString& /*folder*/, wxArrayString& refused,
                                       JobItemArray& items, wxArrayString** files) {
    return RunOperation(Result::Failure, [&] {
        const wxArrayString copy = **files;
        wxArrayString spare;
        return ScreenFiles(copy, spare, refused, items);
    });
}
