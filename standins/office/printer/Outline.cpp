#include "standins/office/printer/Outline.h"

#include "standins/office/shared/GObjectReference.h"

#include <glib.h>
#include <gsf/gsf-infile-zip.h>
#include <gsf/gsf-input-stdio.h>
#include <gsf/gsf-utils.h>
#include <unistd.h>

#include <algorithm>
#include <set>
#include <stdexcept>
#include <string_view>

namespace standins {

namespace {

/// The attributes of an element, as GLib's parser has them.
class Attributes {
public:
    Attributes(const gchar** names, const gchar** values) : m_names(names), m_values(values) {}

    std::string_view operator[](std::string_view name) const {
        for (std::size_t i = 0; m_names[i]; ++i) {
            if (name == m_names[i])
                return m_values[i];
        }
        return {};
    }

private:
    const gchar** m_names;
    const gchar** m_values;
};

/// Follows the elements of content.xml and gathers the outline.
class OutlineReader {
public:
    explicit OutlineReader(bool withHidden) : m_withHidden(withHidden) {}

    void Start(std::string_view element, const Attributes& attributes);
    void End(std::string_view element);
    void Text(std::string_view text);

    std::vector<Paragraph> Take() { return std::move(m_outline); }

private:
    enum class Placeholder { None, Title, Text };

    void StartSlide(std::string_view style);
    void EndSlide();
    void EndParagraph();

    bool m_withHidden;
    std::string m_style; ///< the one that is being defined
    std::set<std::string, std::less<>> m_hiddenStyles;
    int m_slide = 0;                ///< counted from 1
    bool m_isLeftOut = false;       ///< the current slide
    std::string m_title;            ///< of the current slide
    std::vector<Paragraph> m_texts; ///< of the current slide
    int m_notes = 0;                ///< how deep in elements that are not on the slide
    Placeholder m_placeholder = Placeholder::None;
    int m_lists = 0; ///< how many lists are open
    bool m_isInParagraph = false;
    std::string m_words; ///< of the current paragraph
    std::vector<Paragraph> m_outline;
};

bool IsBesideTheSlide(std::string_view element) {
    return element == "presentation:notes" || element == "officeooo:annotation" ||
           element == "office:annotation";
}

/// What OpenDocument has instead of white space that matters.
std::string Space(std::string_view element, const Attributes& attributes) {
    if (element == "text:tab" || element == "text:line-break")
        return " ";
    if (element != "text:s")
        return {};
    const long count = std::strtol(std::string(attributes["text:c"]).c_str(), nullptr, 10);
    return std::string(static_cast<std::size_t>(std::clamp(count, 1L, 100L)), ' ');
}

void OutlineReader::Start(std::string_view element, const Attributes& attributes) {
    if (element == "style:style")
        m_style = attributes["style:name"];
    else if (element == "style:drawing-page-properties" &&
             attributes["presentation:visibility"] == "hidden")
        m_hiddenStyles.insert(m_style);
    else if (element == "draw:page")
        StartSlide(attributes["draw:style-name"]);
    else if (IsBesideTheSlide(element))
        ++m_notes;
    if (m_notes > 0)
        return;
    const std::string_view kind = attributes["presentation:class"];
    if (kind == "title")
        m_placeholder = Placeholder::Title;
    else if (kind == "subtitle" || kind == "outline")
        m_placeholder = Placeholder::Text;
    else if (element == "text:list")
        ++m_lists;
    else if (element == "text:p" || element == "text:h")
        m_isInParagraph = true;
    else if (m_isInParagraph)
        m_words += Space(element, attributes);
}

void OutlineReader::End(std::string_view element) {
    if (IsBesideTheSlide(element))
        --m_notes;
    else if (m_notes > 0)
        return;
    else if (element == "draw:page")
        EndSlide();
    else if (element == "draw:frame" || element == "draw:custom-shape")
        m_placeholder = Placeholder::None;
    else if (element == "text:list")
        --m_lists;
    else if (element == "text:p" || element == "text:h")
        EndParagraph();
}

void OutlineReader::Text(std::string_view text) {
    if (m_isInParagraph && m_notes == 0 && m_placeholder != Placeholder::None)
        m_words += text;
}

void OutlineReader::StartSlide(std::string_view style) {
    ++m_slide;
    m_isLeftOut = !m_withHidden && m_hiddenStyles.count(style) > 0;
    m_title.clear();
    m_texts.clear();
}

void OutlineReader::EndSlide() {
    if (m_isLeftOut)
        return;
    Paragraph title;
    title.mark = std::to_string(m_slide);
    title.text = m_title;
    title.indent = 24;
    title.size = 14;
    title.isBold = true;
    title.spaceAbove = 10;
    m_outline.push_back(std::move(title));
    std::move(m_texts.begin(), m_texts.end(), std::back_inserter(m_outline));
}

void OutlineReader::EndParagraph() {
    std::string words = std::move(m_words);
    m_words.clear();
    m_isInParagraph = false;
    if (words.empty())
        return;
    if (m_placeholder == Placeholder::Title) {
        m_title += (m_title.empty() ? "" : " ") + words;
    } else if (m_placeholder == Placeholder::Text) {
        constexpr int Deepest = 9;
        Paragraph text;
        text.text = std::move(words);
        text.mark = m_lists > 0 ? "•" : "";
        text.indent = 42 + 18 * std::clamp(m_lists - 1, 0, Deepest);
        text.spaceAbove = 2;
        m_texts.push_back(std::move(text));
    }
}

void StartElement(GMarkupParseContext* /*context*/, const gchar* element, const gchar** names,
                  const gchar** values, gpointer reader, GError** /*error*/) {
    static_cast<OutlineReader*>(reader)->Start(element, Attributes(names, values));
}

void EndElement(GMarkupParseContext* /*context*/, const gchar* element, gpointer reader,
                GError** /*error*/) {
    static_cast<OutlineReader*>(reader)->End(element);
}

void AddText(GMarkupParseContext* /*context*/, const gchar* text, gsize size, gpointer reader,
             GError** /*error*/) {
    static_cast<OutlineReader*>(reader)->Text({text, size});
}

GObjectReference<GsfInput> OpenContent(int presentation) {
    gsf_init();
    std::FILE* stream = fdopen(dup(presentation), "rb");
    const GObjectReference<GsfInput> file(
        stream ? gsf_input_stdio_new_FILE("presentation", stream, FALSE) : nullptr);
    const GObjectReference<GsfInfile> package(file ? gsf_infile_zip_new(file.get(), nullptr)
                                                   : nullptr);
    GObjectReference<GsfInput> content(
        package ? gsf_infile_child_by_name(package.get(), "content.xml") : nullptr);
    if (!content)
        throw std::runtime_error("its outline cannot be read");
    return content;
}

} // namespace

std::vector<Paragraph> ReadOutline(int presentation, bool withHidden) {
    constexpr gsf_off_t ChunkSize = 64 << 10;
    constexpr GMarkupParser Parser = {StartElement, EndElement, AddText, nullptr, nullptr};
    const GObjectReference<GsfInput> content = OpenContent(presentation);
    OutlineReader reader(withHidden);
    const std::unique_ptr<GMarkupParseContext, decltype(&g_markup_parse_context_unref)> context(
        g_markup_parse_context_new(&Parser, {}, &reader, nullptr), g_markup_parse_context_unref);
    while (const gsf_off_t size = std::min(gsf_input_remaining(content.get()), ChunkSize)) {
        const guint8* chunk =
            gsf_input_read(content.get(), static_cast<std::size_t>(size), nullptr);
        if (!chunk || !g_markup_parse_context_parse(
                          context.get(), reinterpret_cast<const char*>(chunk), size, nullptr))
            throw std::runtime_error("its outline cannot be read");
    }
    return reader.Take();
}

} // namespace standins
