#include "standins/office/printer/PostScriptWriter.h"

#include "standins/office/printer/Outline.h"
#include "standins/office/printer/PdfSheets.h"
#include "standins/office/printer/Text.h"

#include <stdexcept>

namespace standins {

namespace {

struct Sheet {
    const Sheets* sheets;
    int number;
};

std::vector<Sheet> AllSheets(const std::vector<const Sheets*>& groups) {
    std::vector<Sheet> all;
    for (const Sheets* sheets : groups) {
        for (int number = 0; number < sheets->Count(); ++number)
            all.push_back({sheets, number});
    }
    return all;
}

Failure Print(const std::vector<Sheet>& sheets, PostScriptOutput& output, const PrintJob& job) {
    if (sheets.empty())
        return {"it has no pages"};
    const auto count = static_cast<long>(sheets.size());
    for (long i = 0; i < count * job.copies && output.IsGood(); ++i) {
        const Sheet& sheet =
            sheets[static_cast<std::size_t>(job.collate ? i % count : i / job.copies)];
        sheet.sheets->Print(sheet.number, output);
    }
    return output.Finish();
}

std::vector<Paragraph> CommentTexts(const std::vector<Comment>& comments) {
    std::vector<Paragraph> texts;
    for (std::size_t i = 0; i < comments.size(); ++i) {
        const Comment& comment = comments[i];
        Paragraph heading;
        heading.mark = std::to_string(i + 1);
        heading.text = comment.author + (comment.date.empty() ? "" : ", " + comment.date);
        heading.indent = 24;
        heading.isBold = true;
        heading.spaceAbove = 10;
        texts.push_back(std::move(heading));
        Paragraph text;
        text.text = comment.text;
        text.indent = 24;
        texts.push_back(std::move(text));
    }
    return texts;
}

} // namespace

Failure WritePostScript(int document, PostScriptOutput& output, const PrintJob& job) {
    if (job.contents == Contents::Outline) {
        const TextSheets outline(ReadOutline(document, job.printHidden), PaperFor(job));
        return Print(AllSheets({&outline}), output, job);
    }
    const PdfDocument pdf(document);
    const std::vector<Comment> comments = job.comments ? pdf.Comments() : std::vector<Comment>();
    const PdfSheets pages(pdf, job, comments);
    const TextSheets notes(CommentTexts(comments), PaperFor(job));
    return Print(AllSheets({&pages, &notes}), output, job);
}

} // namespace standins
