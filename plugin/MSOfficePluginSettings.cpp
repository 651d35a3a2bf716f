#include "plugin/MSOfficePluginImpl.h"
#include "plugin/settings/FilterSettings.h"
#include "plugin/settings/SettingsXml.h"
#include "ui/MSOfficePanel.h"

int MSOfficePluginImpl::ApplySettings(const wxXmlNode* settings) {
    return RunOperation(Result::Success, [&] {
        ReadSettingsXml(settings, m_settings);

        // Asking for a missing key enters it with an empty value: from here on the map, and what
        // is saved of it, holds every key that was asked for here. The panel has keys of its own.
        const auto text = [this](const Setting& setting) { return m_settings[setting.key]; };
        const auto isOn = [&text](const Setting& setting) { return text(setting) == "1"; };

        m_printerName = text(FilterSettings::Printer);
        m_psOutput = isOn(FilterSettings::OutputPS);
        m_distillerProfile = text(FilterSettings::DistillerProfile);

        PowerPointOptions& options = m_powerPointOptions;
        options.outputType = text(FilterSettings::OutputType);
        options.colour = text(FilterSettings::Colour);
        options.slidesPerPage = text(FilterSettings::SlidesPerPage);
        if (isOn(FilterSettings::HandoutsHorizontal))
            options.handoutOrder = "1";
        else if (isOn(FilterSettings::HandoutsVertical))
            options.handoutOrder = "2";
        options.scaleToFit = isOn(FilterSettings::ScaleToFitPage);
        options.frameSlides = isOn(FilterSettings::FrameSlides);
        options.printHiddenSlides = isOn(FilterSettings::PrintHiddenSlides);
        options.printCommentsAndInkMarkup = isOn(FilterSettings::PrintCommentsAndInkMarkup);
        options.highQuality = isOn(FilterSettings::HighQuality);
        return Result::Success;
    });
}

int MSOfficePluginImpl::LoadSettings(const wxXmlNode* settings) {
    return RunOperation(Result::Success, [&] {
        ReadSettingsXml(settings, m_settings);
        return Result::Success;
    });
}

int MSOfficePluginImpl::SaveSettings(wxXmlNode* parent) {
    return RunOperation(Result::Success, [&] {
        if (m_panel)
            m_panel->WriteSettings(m_settings);
        AppendSettingsXml(parent, m_settings);
        return Result::Success;
    });
}
