#include "plugin/MSOfficePluginImpl.h"
#include "plugin/settings/SettingsXml.h"
#include "ui/MSOfficePanel.h"

int MSOfficePluginImpl::ApplySettings(const wxXmlNode* settings) {
    return RunOperation(Result::Success, [&] {
        ReadSettingsXml(settings, m_settings);

        // Asking for a missing key enters it with an empty value: from here on the map, and what
        // is saved of it, holds every key that was asked for here. The panel has keys of its own.
        const auto isOn = [this](const char* key) { return m_settings[key] == "1"; };

        m_printerName = m_settings["PRINTER"];
        m_psOutput = isOn("OUTPUTFILETYPEPS");
        m_distillerProfile = m_settings["SELECTEDDISTILLERPROFILE"];

        PowerPointOptions& options = m_powerPointOptions;
        options.outputType = m_settings["PRINTOUTPUTTYPE"];
        options.colour = m_settings["COLOR"];
        options.slidesPerPage = m_settings["SLIDESPERPAGE"];
        if (isOn("HANDOUTSHORIZONTAL"))
            options.handoutOrder = "1";
        else if (isOn("HANDOUTSVERTICAL"))
            options.handoutOrder = "2";
        options.scaleToFit = isOn("SCALETOFITPAGE");
        options.frameSlides = isOn("FRAMESLIDES");
        options.printHiddenSlides = isOn("PRINTHIDDENSLIDES");
        options.printCommentsAndInkMarkup = isOn("PRINTCOMMENTSANDINKMARKUP");
        options.highQuality = isOn("HIGHQUALITY");
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
