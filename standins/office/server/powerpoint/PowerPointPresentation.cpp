#include "standins/office/server/powerpoint/PowerPointPresentation.h"

#include "standins/office/server/FilePrinter.h"
#include "standins/office/server/Printers.h"
#include "standins/office/server/powerpoint/PowerPointPrintOptions.h"

namespace standins {

namespace {

/// The arguments of PrintOut, in order.
enum PrintArgument : UINT { From, To, PrintToFileName, Copies, Collate };

constexpr LONG Whole = -1; // from the first slide, to the last one

} // namespace

PowerPointPresentation::PowerPointPresentation(SharedSession session, OpenedDocument document)
    : AutomationObject(std::move(session)), m_document(std::move(document)),
      m_print(std::make_shared<PresentationPrint>()) {
    m_print->printer = TheSession()->printer;
}

const std::vector<Member>& PowerPointPresentation::Members() const {
    static const std::vector<Member> members = {
        {2033, DISPATCH_PROPERTYGET, L"PrintOptions", 0, 0,
         Handle<&PowerPointPresentation::PrintOptions>},
        {2034, DISPATCH_METHOD, L"PrintOut", 0, 5, Handle<&PowerPointPresentation::PrintOut>},
        {2039, DISPATCH_METHOD, L"Close", 0, 0, Handle<&PowerPointPresentation::Close>},
    };
    return members;
}

void PowerPointPresentation::PrintOptions(Call& call) {
    call.Return(MakeObject<PowerPointPrintOptions>(TheSession(), m_print));
}

void PowerPointPresentation::PrintOut(Call& call) {
    m_document.Pages(); // it is open
    if (call.Number(From, Whole) != Whole || call.Number(To, Whole) != Whole)
        throw Raised{L"A range of slides is not supported: a presentation is printed whole."};
    if (!call.Has(PrintToFileName))
        throw Raised{L"Printing is possible to a file only."};
    RequirePrinter(m_print->printer);
    PrintToFile({m_document.MadeAs(ExportFor(*m_print)), m_document.Name(),
                 call.Text(PrintToFileName), CheckCopies(call.Number(Copies, 1)),
                 call.Flag(Collate, true), LayoutFor(*m_print)});
}

/// What is to be saved does not matter: documents are never changed.
void PowerPointPresentation::Close(Call& /*call*/) {
    m_document.Close();
}

} // namespace standins
