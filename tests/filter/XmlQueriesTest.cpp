#include "common/ServerInformation.h"
#include "core/xml/XmlHelper.h"

#include <wx/log.h>
#include <wx/xml/xml.h>

#include <gtest/gtest.h>

namespace {

TEST(FindNode, GoesAsDeepAsTheDocument) {
    // Built from the inside out and taken apart from the outside in: the toolkit's own tree code
    // recurses.
    auto* const innermost = new wxXmlNode(wxXML_ELEMENT_NODE, "UI");
    wxXmlNode* top = innermost;
    for (int i = 0; i < 200'000; ++i) {
        auto* parent = new wxXmlNode(wxXML_ELEMENT_NODE, "level");
        parent->SetChildren(top);
        top = parent;
    }
    EXPECT_EQ(innermost, FindNode(top, "UI"));
    while (top) {
        wxXmlNode* child = top->GetChildren();
        top->SetChildren(nullptr);
        delete top;
        top = child;
    }
}

TEST(ServerVersionAtLeast, ReadsTheLeadingNumber) {
    const wxLogNull parserStaysQuiet;
    const std::pair<const char*, bool> cases[] = {
        {"", false},
        {"no XML", false},
        {"<ServerVersion>16</ServerVersion>", false}, // the root is no candidate
        {"<a/>", false},
        {"<a><ServerVersion/></a>", false},
        {"<a><ServerVersion>15</ServerVersion></a>", false},
        {"<a><ServerVersion>v16</ServerVersion></a>", false},
        {"<a><ServerVersion>-17</ServerVersion></a>", false},
        {"<a><ServerVersion>2147483648</ServerVersion></a>", false}, // no number of 32 bits
        {"<a><ServerVersion>-2147483649</ServerVersion></a>", false},
        {"<a><ServerVersion>99999999999999999999</ServerVersion></a>", false},
        {"<a><ServerVersion>2147483647</ServerVersion></a>", true},
        {"<a><ServerVersion> 16.2</ServerVersion></a>", true},
        {"<a><b><c><ServerVersion>17 beta</ServerVersion></c></b></a>", true},
    };
    for (const auto& [info, isAtLeast16] : cases)
        EXPECT_EQ(isAtLeast16, ServerVersionAtLeast(info, 16)) << info;
}

} // namespace
