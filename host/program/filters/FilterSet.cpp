#include "host/program/filters/FilterSet.h"

#include "host/program/base/ProgramFiles.h"

FilterSet::FilterSet(const std::filesystem::path& folder) {
    for (const std::filesystem::path& file : ModuleFiles(folder)) {
        std::unique_ptr<FilterModule> module = FilterModule::Load(file);
        std::unique_ptr<Filter> filter = module ? Filter::Start(std::move(module)) : nullptr;
        if (filter)
            m_filters.push_back(std::move(filter));
    }
}

std::set<std::string> FilterSet::Extensions() const {
    std::set<std::string> extensions;
    for (const auto& filter : m_filters)
        for (const wxString& extension : filter->Extensions())
            extensions.insert(extension.Lower().utf8_string());
    return extensions;
}

Filter* FilterSet::Claiming(const wxString& extension) const {
    for (const auto& filter : m_filters)
        if (filter->Claims(extension))
            return filter.get();
    return nullptr;
}

void FilterSet::ApplySettings(const wxXmlNode& settings) {
    for (const auto& filter : m_filters)
        filter->ApplySettings(settings);
}

wxString FilterSet::ErrorText(int code) const {
    return m_filters.empty() ? wxString() : m_filters.front()->ErrorText(code);
}
