#include "host/program/settings/XmlCheck.h"

#include <wx/intl.h>

#include <expat.h>

#include <memory>

namespace {

struct Check {
    XML_Parser parser;
    int depth;
    int maximumDepth;
    wxString fault;

    void Stop(const wxString& reason) {
        fault = reason;
        XML_StopParser(parser, XML_FALSE);
    }
};

void OnStart(void* user, const XML_Char*, const XML_Char**) {
    auto* check = static_cast<Check*>(user);
    if (++check->depth > check->maximumDepth)
        check->Stop(wxString::Format(_("elements nested deeper than %d"), check->maximumDepth));
}

void OnEnd(void* user, const XML_Char*) {
    --static_cast<Check*>(user)->depth;
}

void OnDocumentType(void* user, const XML_Char*, const XML_Char*, const XML_Char*, int) {
    static_cast<Check*>(user)->Stop(_("a document type, which has no place here"));
}

} // namespace

wxString FindXmlFault(std::string_view bytes, int maximumDepth) {
    const std::unique_ptr<XML_ParserStruct, decltype(&XML_ParserFree)> parser(
        XML_ParserCreate(nullptr), XML_ParserFree);
    if (!parser)
        return _("not enough memory to read it");
    Check check = {parser.get(), 0, maximumDepth, {}};
    XML_SetUserData(parser.get(), &check);
    XML_SetElementHandler(parser.get(), OnStart, OnEnd);
    XML_SetStartDoctypeDeclHandler(parser.get(), OnDocumentType);
    if (XML_Parse(parser.get(), bytes.data(), static_cast<int>(bytes.size()), XML_TRUE) ==
        XML_STATUS_OK)
        return {};
    if (check.fault.empty())
        check.fault = XML_ErrorString(XML_GetErrorCode(parser.get()));
    return wxString::Format(_("line %lu: %s"), XML_GetCurrentLineNumber(parser.get()), check.fault);
}
