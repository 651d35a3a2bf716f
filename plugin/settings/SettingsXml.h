#pragma once

#include "plugin/settings/SettingsMap.h"

class wxXmlNode;

/// Adds the settings of the element "UI" below `node` to the map, replacing entries of the same
/// key. Each child element is a setting, its text the value; an empty element says nothing.
void ReadSettingsXml(const wxXmlNode* node, SettingsMap& settings);

/// Appends the whole map to `parent` as a new element "UI", in no particular order.
void AppendSettingsXml(wxXmlNode* parent, const SettingsMap& settings);
