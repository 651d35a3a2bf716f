#pragma once

#include <wx/string.h>

class wxXmlNode;

/// Finds an element below a node, at any depth.
///
/// At every level the children are compared before anything deeper, and deeper levels are searched
/// child by child: a child wins over a grandchild, and whatever stands under the first child wins
/// over what stands under the second.
/// @param parent where to start; it is no candidate itself
/// @param name compared exactly
/// @return a node of the caller's document, or null
wxXmlNode* FindNode(const wxXmlNode* parent, const wxString& name);
