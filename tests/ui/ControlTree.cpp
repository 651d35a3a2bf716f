#include "tests/ui/ControlTree.h"

#include <wx/checkbox.h>
#include <wx/choice.h>
#include <wx/panel.h>
#include <wx/radiobut.h>

namespace {

bool IsTicked(const wxWindow* window) {
    if (const auto* box = dynamic_cast<const wxCheckBox*>(window))
        return box->GetValue();
    if (const auto* button = dynamic_cast<const wxRadioButton*>(window))
        return button->GetValue();
    return false;
}

wxString Described(const wxWindow* window) {
    wxString line(window->GetClassInfo()->GetClassName());
    if (window->GetId() > 0)
        line << ' ' << window->GetId();
    if (const auto* choice = dynamic_cast<const wxChoice*>(window))
        line << " [" << wxJoin(choice->GetStrings(), '|', '\0') << ']';
    else if (!window->GetLabel().empty() && !dynamic_cast<const wxPanel*>(window))
        line << " \"" << window->GetLabel() << '"';
    if (!window->IsThisEnabled())
        line << " disabled";
    if (!window->IsShown())
        line << " hidden";
    if (IsTicked(window))
        line << " ticked";
    return line;
}

void Append(const wxWindow* window, std::size_t depth, std::vector<std::string>& lines) {
    for (const wxWindow* child : window->GetChildren()) {
        lines.push_back(std::string(std::size_t{2} * depth, ' ') + Described(child).utf8_string());
        Append(child, depth + 1, lines);
    }
}

} // namespace

std::vector<std::string> WindowTree(const wxWindow* window) {
    std::vector<std::string> lines;
    Append(window, 0, lines);
    return lines;
}
