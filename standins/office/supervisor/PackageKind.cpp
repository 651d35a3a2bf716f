#include "standins/office/supervisor/PackageKind.h"

#include "standins/office/shared/GObjectReference.h"

#include <glib.h>
#include <gsf/gsf-infile-zip.h>
#include <gsf/gsf-input-stdio.h>
#include <gsf/gsf-utils.h>

#include <algorithm>
#include <memory>
#include <string_view>
#include <vector>

namespace standins {

namespace {

/// The main part of a document has a content type with the application's mark in it.
struct Kind {
    std::string_view mark;
    std::string_view macroMark;    ///< of documents with macros
    std::string_view importFilter; ///< the beginning of LibreOffice's names for it
};

const std::vector<Kind> Kinds = {
    {"wordprocessingml.", "ms-word.", "MS Word 2007 XML"},
    {"spreadsheetml.", "ms-excel.", "Calc MS Excel 2007 XML"},
    {"presentationml.", "ms-powerpoint.", "Impress MS PowerPoint 2007 XML"},
};

/// @return null when it is the main part of no application's document
const Kind* KindOfPart(std::string_view contentType) {
    constexpr std::string_view MainPart = "main+xml";
    if (contentType.size() < MainPart.size() ||
        contentType.substr(contentType.size() - MainPart.size()) != MainPart)
        return nullptr;
    for (const Kind& kind : Kinds) {
        if (contentType.find(kind.mark) != std::string_view::npos ||
            contentType.find(kind.macroMark) != std::string_view::npos)
            return &kind;
    }
    return nullptr;
}

/// The list of the content types of a package's parts.
/// @return empty when there is none
std::string ReadContentTypes(const std::string& path) {
    constexpr gsf_off_t Longest = 1 << 20;
    const GObjectReference<GsfInput> file(gsf_input_stdio_new(path.c_str(), nullptr));
    const GObjectReference<GsfInfile> package(file ? gsf_infile_zip_new(file.get(), nullptr)
                                                   : nullptr);
    const GObjectReference<GsfInput> list(
        package ? gsf_infile_child_by_name(package.get(), "[Content_Types].xml") : nullptr);
    if (!list)
        return {};
    std::string text(static_cast<std::size_t>(std::min(gsf_input_size(list.get()), Longest)), '\0');
    const bool isRead =
        gsf_input_read(list.get(), text.size(), reinterpret_cast<guint8*>(text.data())) != nullptr;
    return isRead ? text : std::string();
}

struct FoundKinds {
    std::vector<const Kind*> kinds;
};

void StartElement(GMarkupParseContext* /*context*/, const gchar* /*element*/, const gchar** names,
                  const gchar** values, gpointer found, GError** /*error*/) {
    for (; *names; ++names, ++values) {
        const Kind* kind = g_strcmp0(*names, "ContentType") == 0 ? KindOfPart(*values) : nullptr;
        if (kind)
            static_cast<FoundKinds*>(found)->kinds.push_back(kind);
    }
}

FoundKinds KindsOfParts(const std::string& contentTypes) {
    constexpr GMarkupParser Parser = {StartElement, nullptr, nullptr, nullptr, nullptr};
    FoundKinds found;
    const std::unique_ptr<GMarkupParseContext, decltype(&g_markup_parse_context_unref)> context(
        g_markup_parse_context_new(&Parser, {}, &found, nullptr), g_markup_parse_context_unref);
    g_markup_parse_context_parse(context.get(), contentTypes.data(),
                                 static_cast<gssize>(contentTypes.size()), nullptr);
    return found;
}

bool IsFor(const Kind& kind, const std::string& importFilter) {
    return importFilter.compare(0, kind.importFilter.size(), kind.importFilter) == 0;
}

} // namespace

bool IsPackageOfAnotherKind(const std::string& path, const std::string& importFilter) {
    const bool isPackage = std::any_of(Kinds.begin(), Kinds.end(),
                                       [&](const Kind& kind) { return IsFor(kind, importFilter); });
    if (!isPackage)
        return false;
    gsf_init();
    const FoundKinds found = KindsOfParts(ReadContentTypes(path));
    return !found.kinds.empty() && // one of its own is enough
           std::none_of(found.kinds.begin(), found.kinds.end(),
                        [&](const Kind* kind) { return IsFor(*kind, importFilter); });
}

} // namespace standins
