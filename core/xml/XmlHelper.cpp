#include "core/xml/XmlHelper.h"

#include <wx/xml/xml.h>

#include <algorithm>
#include <cstddef>
#include <vector>

namespace {

bool IsElement(const wxXmlNode* node) {
    return node->GetType() == wxXML_ELEMENT_NODE;
}

wxXmlNode* FindChild(const wxXmlNode* parent, const wxString& name) {
    for (wxXmlNode* child = parent->GetChildren(); child; child = child->GetNext())
        if (IsElement(child) && child->GetName() == name)
            return child;
    return nullptr;
}

} // namespace

wxXmlNode* FindNode(const wxXmlNode* parent, const wxString& name) {
    // A stack of our own instead of recursion: the depth of the tree is the document's choice.
    std::vector<const wxXmlNode*> pending{parent};
    while (!pending.empty()) {
        const wxXmlNode* node = pending.back();
        pending.pop_back();
        if (wxXmlNode* found = FindChild(node, name))
            return found;

        const auto firstOfLevel = static_cast<std::ptrdiff_t>(pending.size());
        for (const wxXmlNode* child = node->GetChildren(); child; child = child->GetNext())
            if (IsElement(child))
                pending.push_back(child);
        std::reverse(pending.begin() + firstOfLevel, pending.end());
    }
    return nullptr;
}
