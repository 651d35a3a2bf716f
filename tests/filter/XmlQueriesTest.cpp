#include "common/ServerInformation.h"
#include "core/xml/XmlHelper.h"

#include <wx/log.h>
#include <wx/sstream.h>
#include <wx/xml/xml.h>

#include <gtest/gtest.h>

namespace {

struct Search {
    const char* document;
    const char* name;
    const char* found; ///< the attribute "id" of the element found; empty for none
};

class FindNodeTest : public testing::TestWithParam<Search> {};

TEST_P(FindNodeTest, TakesTheFirstInItsOrder) {
    wxStringInputStream stream(GetParam().document);
    wxXmlDocument document;
    ASSERT_TRUE(document.Load(stream, "UTF-8"));

    const wxXmlNode* found = FindNode(document.GetRoot(), GetParam().name);
    EXPECT_EQ(GetParam().found, found ? found->GetAttribute("id") : wxString());
}

INSTANTIATE_TEST_SUITE_P(
    Orders, FindNodeTest,
    testing::Values(
        Search{"<r/>", "UI", ""}, Search{"<UI id='root'/>", "UI", ""},
        Search{"<UI id='root'><a><UI id='below'/></a></UI>", "UI", "below"},
        Search{"<r><UI id='upper'/></r>", "ui", ""},
        Search{"<r>UI<!--UI--><?UI x?><UI id='element'/></r>", "UI", "element"},
        Search{"<r><a><UI id='grandchild'/></a><UI id='child'/></r>", "UI", "child"},
        Search{"<r><a><b><UI id='deep, first'/></b></a><c><UI id='shallow, second'/></c></r>", "UI",
               "deep, first"},
        Search{"<r><a><b/></a><c><d/><UI id='second child'/></c><UI2/></r>", "UI",
               "second child"}));

TEST(FindNode, GoesAsDeepAsTheDocument) {
    // Built by hand from the inside out, and taken apart again from the outside in, since the
    // toolkit's own tree code recurses.
    constexpr int Depth = 200'000;
    auto* innermost = new wxXmlNode(wxXML_ELEMENT_NODE, "UI");
    wxXmlNode* top = innermost;
    for (int i = 0; i < Depth; ++i) {
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

struct VersionText {
    const char* serverInfo;
    bool isAtLeast16;
};

class ServerVersionTest : public testing::TestWithParam<VersionText> {};

TEST_P(ServerVersionTest, ReadsTheLeadingNumber) {
    const wxLogNull parserStaysQuiet;
    EXPECT_EQ(GetParam().isAtLeast16, ServerVersionAtLeast(GetParam().serverInfo, 16));
}

INSTANTIATE_TEST_SUITE_P(
    Texts, ServerVersionTest,
    testing::Values(VersionText{"", false}, VersionText{"no XML", false},
                    VersionText{"<a/>", false}, VersionText{"<a><ServerVersion/></a>", false},
                    VersionText{"<ServerVersion>16</ServerVersion>",
                                false}, // the root is no candidate
                    VersionText{"<a><ServerVersion>15</ServerVersion></a>", false},
                    VersionText{"<a><ServerVersion>16</ServerVersion></a>", true},
                    VersionText{"<a><ServerVersion> 16.2</ServerVersion></a>", true},
                    VersionText{"<a><ServerVersion>17 beta</ServerVersion></a>", true},
                    VersionText{"<a><ServerVersion>v16</ServerVersion></a>", false},
                    VersionText{"<a><ServerVersion>-17</ServerVersion></a>", false},
                    VersionText{"<a><b><c><ServerVersion>16</ServerVersion></c></b></a>", true},
                    VersionText{"<a><b><ServerVersion>16</ServerVersion></b>"
                                "<ServerVersion>15</ServerVersion></a>",
                                false}));

} // namespace
