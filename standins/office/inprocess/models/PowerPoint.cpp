// PowerPoint's object model.

#include "standins/office/inprocess/Applications.h"
#include "standins/office/inprocess/Printers.h"
#include "standins/office/inprocess/models/ObjectModel.h"
#include "standins/office/inprocess/models/PresentationPrint.h"

#include <algorithm>
#include <initializer_list>

namespace standins {

namespace {

const std::vector<DocumentFormat> Formats = {
    {"ppt", "MS PowerPoint 97", SlidesExport, HiddenSlidesExport},
    {"pps", "MS PowerPoint 97 AutoPlay", SlidesExport, HiddenSlidesExport},
    {"pptx", "Impress MS PowerPoint 2007 XML", SlidesExport, HiddenSlidesExport},
    {"ppsx", "Impress MS PowerPoint 2007 XML AutoPlay", SlidesExport, HiddenSlidesExport},
};

using SharedPrint = std::shared_ptr<PresentationPrint>;

/// A value that must be one of a few.
template <typename Value>
Value OneOf(const Call& call, const wchar_t* what, std::initializer_list<Value> values) {
    const LONG number = call.Number(0);
    const auto* found = std::find_if(values.begin(), values.end(), [&](Value value) {
        return static_cast<LONG>(value) == number;
    });
    if (found == values.end())
        throw Raised{std::wstring(what) + L" cannot be " + std::to_wstring(number) + L"."};
    return *found;
}

/// The print options of one presentation.
class PowerPointPrintOptions : public AutomationObject {
public:
    using Print = PresentationPrint;
    using Options = PowerPointPrintOptions;

    PowerPointPrintOptions(SharedSession session, SharedPrint print)
        : AutomationObject(
              std::move(session),
              {
                  Put<&Options::PutPrintColorType>(2002, L"PrintColorType"),
                  Put<&Options::PutFlag<&Print::fitToPage>>(2004, L"FitToPage"),
                  Put<&Options::PutFlag<&Print::frames>>(2005, L"FrameSlides"),
                  Put<&Options::PutOutputType>(2007, L"OutputType"),
                  Put<&Options::PutFlag<&Print::hiddenSlides>>(2009, L"PrintHiddenSlides"),
                  Put<&Options::PutPrintInBackground>(2010, L"PrintInBackground"),
                  Put<&Options::PutActivePrinter>(2015, L"ActivePrinter"),
                  Put<&Options::PutHandoutOrder>(2016, L"HandoutOrder"),
                  Put<&Options::PutFlag<&Print::comments>>(2017, L"PrintComments"),
              }),
          m_print(std::move(print)) {}

private:
    template <bool Print::*Option>
    void PutFlag(Call& call) {
        (*m_print).*Option = call.Flag(0);
    }

    void PutPrintColorType(Call& call) {
        m_print->colour = OneOf(call, L"PrintColorType",
                                {Print::Color, Print::BlackAndWhite, Print::PureBlackAndWhite});
    }

    void PutOutputType(Call& call) {
        m_print->output =
            OneOf(call, L"OutputType",
                  {Print::Slides, Print::OneSlideHandouts, Print::TwoSlideHandouts,
                   Print::ThreeSlideHandouts, Print::FourSlideHandouts, Print::SixSlideHandouts,
                   Print::NineSlideHandouts, Print::NotesPages, Print::Outline});
    }

    /// The print is done when the call returns, which suits either wish.
    void PutPrintInBackground(Call& call) { call.Flag(0); }

    void PutActivePrinter(Call& call) {
        const std::wstring printer = call.Text(0);
        RequirePrinter(printer);
        m_print->printer = printer;
    }

    void PutHandoutOrder(Call& call) {
        m_print->order = OneOf(call, L"HandoutOrder", {Print::AcrossFirst, Print::DownFirst});
    }

    SharedPrint m_print;
};

class PowerPointPresentation : public DocumentObject {
public:
    PowerPointPresentation(const SharedSession& session, OpenedDocument document)
        : DocumentObject(session, std::move(document),
                         {
                             Get<&PowerPointPresentation::PrintOptions>(2033, L"PrintOptions"),
                             Method<&PowerPointPresentation::PrintOut>(2034, L"PrintOut", 0, 5),
                             Method<&PowerPointPresentation::Close>(2039, L"Close", 0, 0),
                         }),
          m_print(std::make_shared<PresentationPrint>()) {
        m_print->printer = session->printer;
    }

private:
    void PrintOptions(Call& call) {
        call.Return(MakeObject<PowerPointPrintOptions>(TheSession(), m_print));
    }

    void PrintOut(Call& call) {
        Document().Pages(); // it is open
        RequireWholeToFile(call,
                           L"A range of slides is not supported: a presentation is printed whole.");
        RequirePrinter(m_print->printer);
        Print(call, m_print->printer, AfterRange, Document().MadeAs(ExportFor(*m_print)),
              LayoutFor(*m_print));
    }

    SharedPrint m_print;
};

class PowerPointPresentations : public AutomationObject {
public:
    explicit PowerPointPresentations(SharedSession session)
        : AutomationObject(std::move(session),
                           {Method<&PowerPointPresentations::Open>(2004, L"Open", 1, 4)}) {}

private:
    /// The other arguments have no bearing: nothing is changed or shown.
    void Open(Call& call) { ReturnOpened<PowerPointPresentation>(call, TheSession(), Formats); }
};

class PowerPointApplication : public ApplicationObject {
public:
    PowerPointApplication()
        : ApplicationObject(L"PowerPoint",
                            {
                                Get<&PowerPointApplication::Presentations>(2001, L"Presentations"),
                                Method<&PowerPointApplication::Quit>(2021, L"Quit", 0, 0),
                            }) {}

private:
    void Presentations(Call& call) {
        call.Return(MakeObject<PowerPointPresentations>(TheSession()));
    }
};

} // namespace

IDispatch* StartPowerPoint() {
    return MakeObject<PowerPointApplication>();
}

} // namespace standins
