#pragma once

#include "plugin/MSOfficePluginImpl.h"
#include "plugin/interface/ControlIds.h"
#include "plugin/settings/FilterSettings.h"
#include "tests/ui/UiTest.h"

#include <wx/frame.h>

#include <map>

using Settings = std::map<std::string, std::string>;

/// Which control shows which setting: the word of the tests against the panel's own.
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

/// A panel in a host's window.
class PanelFixture : public UiTest {
protected:
    ~PanelFixture() override { CloseHost(); }

    /// Installs m_machine, and makes the panel on it, loaded from the settings.
    void BuildPanel(const Settings& settings = {});
    void CloseHost();

    /// What SaveSettings writes.
    Settings Saved();

    /// What the controls show, by setting.
    Settings Shown() const;

    const wxWindow* Window() const override { return m_panel; }
    bool AreEnabled(std::initializer_list<int> ids, bool enabled) const;

    // Each makes a choice and tells of it.
    void Tick(int id, bool ticked);
    void Press(int id);

    Machine m_machine;
    const char* m_serverVersion = "16";
    std::optional<MSOfficePluginImpl> m_plugin;
    wxFrame* m_host = nullptr;
    wxWindow* m_panel = nullptr;
};
