#pragma once

#include "plugin/settings/FilterSettings.h"
#include "plugin/settings/SettingsMap.h"

#include <variant>
#include <vector>

class wxWindow;

/// A value of a panel: the control that shows it, the setting that stores it, the panel's member.
struct PanelValue {
    int control;
    const Setting& setting;
    std::variant<bool*, wxString*> member;
};

/// The values of a panel: what is done with all of them alike.
class PanelValues {
public:
    PanelValues(std::initializer_list<PanelValue> values) : m_values(values) {}

    /// Has the controls of `panel` show the members at each transfer of data.
    void Bind(const wxWindow& panel) const;

    /// Sets the members to what is stored; where that is missing or empty, to the panel's standard
    /// or, where there is none, to what they are. A missing setting is entered with an empty text.
    void Read(SettingsMap& settings) const;
    void Write(SettingsMap& settings) const;

    /// The member that a control shows, which must be of that type.
    template <typename Member>
    Member& MemberOf(int control) const {
        return *std::get<Member*>(Find(control).member);
    }

private:
    const PanelValue& Find(int control) const;

    std::vector<PanelValue> m_values;
};
