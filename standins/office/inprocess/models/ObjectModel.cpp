#include "standins/office/inprocess/models/ObjectModel.h"

#include "standins/office/inprocess/Papers.h"
#include "standins/office/inprocess/Printers.h"

namespace standins {

ApplicationObject::ApplicationObject(const wchar_t* name, std::vector<Member> members)
    : AutomationObject(std::make_shared<Session>(name, DefaultPrinter()), std::move(members)) {}

void ApplicationObject::Quit(Call& /*call*/) {
    TheSession()->isRunning = false;
}

DocumentObject::DocumentObject(SharedSession session, OpenedDocument document,
                               std::vector<Member> members)
    : AutomationObject(std::move(session), std::move(members)), m_document(std::move(document)) {}

void DocumentObject::Close(Call& /*call*/) {
    m_document.Close();
}

void DocumentObject::Print(const Call& call, const std::wstring& printer,
                           const PrintArguments& arguments, Export pages,
                           std::vector<std::string> layout) const {
    const std::vector<std::string> papers = PaperOptions(printer);
    layout.insert(layout.end(), papers.begin(), papers.end());
    PrintToFile({std::move(pages), m_document.Name(), call.Text(arguments.outputFile),
                 CheckCopies(call.Number(arguments.copies, 1)), call.Flag(arguments.collate, true),
                 std::move(layout)});
}

void RaiseNotToFile() {
    throw Raised{L"Printing is possible to a file only."};
}

void RequireWholeToFile(const Call& call, const wchar_t* notWhole) {
    constexpr UINT From = 0;
    constexpr UINT To = 1;
    constexpr LONG Whole = -1; // from the first page, to the last one
    if (call.Number(From, Whole) != Whole || call.Number(To, Whole) != Whole)
        throw Raised{notWhole};
    if (!call.Has(AfterRange.outputFile))
        RaiseNotToFile();
}

} // namespace standins
