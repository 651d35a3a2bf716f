#pragma once

#include "plugin/MSOfficePluginImpl.h"
#include "plugin/interface/ControlIds.h"
#include "plugin/settings/FilterSettings.h"
#include "tests/support/RecordingOffice.h"
#include "tests/support/TemporaryFolder.h"
#include "tests/support/TestPrinter.h"

#include <wx/choice.h>
#include <wx/frame.h>
#include <wx/window.h>

#include <gtest/gtest.h>

#include <map>
#include <memory>
#include <optional>
#include <vector>

using Settings = std::map<std::string, std::string>;

/// Which control shows which setting.
struct SettingControl {
    int id;
    const Setting& setting;
};
const SettingControl SettingControls[] = {
    {ControlId::Printer, FilterSettings::Printer},
    {ControlId::OutputPS, FilterSettings::OutputPS},
    {ControlId::OutputPDF, FilterSettings::OutputPDF},
    {ControlId::DistillerProfile, FilterSettings::DistillerProfile},
    {ControlId::Print, FilterSettings::OutputType},
    {ControlId::Colour, FilterSettings::Colour},
    {ControlId::SlidesPerPage, FilterSettings::SlidesPerPage},
    {ControlId::OrderHorizontal, FilterSettings::HandoutsHorizontal},
    {ControlId::OrderVertical, FilterSettings::HandoutsVertical},
    {ControlId::ScaleToFitPaper, FilterSettings::ScaleToFitPage},
    {ControlId::PrintHiddenSlides, FilterSettings::PrintHiddenSlides},
    {ControlId::FrameSlides, FilterSettings::FrameSlides},
    {ControlId::HighQuality, FilterSettings::HighQuality},
    {ControlId::PrintCommentsAndInkMarkup, FilterSettings::PrintCommentsAndInkMarkup},
};

/// A panel in a host's window, on a machine that the test describes.
class PanelFixture : public testing::Test {
protected:
    struct Machine {
        std::vector<std::wstring> applications = {L"Word.Application", L"PowerPoint.Application"};
        int officeVersion = 16;
        std::vector<std::wstring> printers = {L"Adobe PDF", L"Proofer"};
        std::vector<const char*> profiles = {"Press.joboptions", "Print.joboptions"};
        const char* serverVersion = "16";
    };

    PanelFixture();
    ~PanelFixture() override;

    /// Makes the machine as described, in place of an earlier one, and the panel on it, loaded from
    /// the settings.
    void BuildPanel(const Settings& settings = {});
    void CloseHost();

    /// What SaveSettings writes.
    Settings Saved();

    /// What the controls show, by setting.
    Settings Shown() const;

    wxWindow* Find(int id) const;
    wxChoice* Choice(int id) const;
    bool IsTicked(int id) const; ///< of a check box or a radio button
    std::string Selection(int id) const;
    bool AreEnabled(std::initializer_list<int> ids, bool enabled) const;

    /// Sends the command event that the user's choice would cause, after making the choice.
    void Choose(int id, const char* entry);
    void Tick(int id, bool ticked);
    void Press(int id);

    Machine m_machine;
    TemporaryFolder m_folder;
    std::optional<RecordingOffice> m_office;
    std::vector<std::unique_ptr<TestPrinter>> m_testPrinters;
    std::optional<MSOfficePluginImpl> m_plugin;
    wxFrame* m_host = nullptr;
    wxWindow* m_panel = nullptr;

private:
    void Tell(wxEventType type, int id, int value);
};
