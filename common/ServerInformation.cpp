#include "common/ServerInformation.h"

#include "core/xml/XmlHelper.h"

#include <wx/sstream.h>
#include <wx/xml/xml.h>

#include <algorithm>
#include <limits>

bool ServerVersionAtLeast(const wxString& serverInfo, std::int32_t minimum) {
    if (serverInfo.empty())
        return false;
    wxStringInputStream stream(serverInfo);
    wxXmlDocument document;
    if (!document.Load(stream, "UTF-8") || !document.GetRoot())
        return false;

    const wxXmlNode* element = FindNode(document.GetRoot(), "ServerVersion");
    if (!element || !element->GetChildren())
        return false;

    // ToLong leaves in `version` the number that the text begins with, whatever follows it. One
    // that does not fit a long it leaves out, and so do we where a long has more than 32 bits.
    using Limits = std::numeric_limits<std::int32_t>;
    long version = 0;
    element->GetChildren()->GetContent().ToLong(&version);
    if (std::clamp<long>(version, Limits::min(), Limits::max()) != version)
        version = 0;
    return version >= minimum;
}
