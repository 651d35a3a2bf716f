#include "standins/office/server/powerpoint/PowerPointPrintOptions.h"

#include "standins/office/server/Printers.h"

#include <algorithm>
#include <initializer_list>

namespace standins {

namespace {

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

} // namespace

const std::vector<Member>& PowerPointPrintOptions::Members() const {
    using Options = PowerPointPrintOptions;
    static const std::vector<Member> members = {
        {2002, DISPATCH_PROPERTYPUT, L"PrintColorType", 1, 1, Handle<&Options::PutPrintColorType>},
        {2004, DISPATCH_PROPERTYPUT, L"FitToPage", 1, 1, Handle<&Options::PutFitToPage>},
        {2005, DISPATCH_PROPERTYPUT, L"FrameSlides", 1, 1, Handle<&Options::PutFrameSlides>},
        {2007, DISPATCH_PROPERTYPUT, L"OutputType", 1, 1, Handle<&Options::PutOutputType>},
        {2009, DISPATCH_PROPERTYPUT, L"PrintHiddenSlides", 1, 1,
         Handle<&Options::PutPrintHiddenSlides>},
        {2010, DISPATCH_PROPERTYPUT, L"PrintInBackground", 1, 1,
         Handle<&Options::PutPrintInBackground>},
        {2015, DISPATCH_PROPERTYPUT, L"ActivePrinter", 1, 1, Handle<&Options::PutActivePrinter>},
        {2016, DISPATCH_PROPERTYPUT, L"HandoutOrder", 1, 1, Handle<&Options::PutHandoutOrder>},
        {2017, DISPATCH_PROPERTYPUT, L"PrintComments", 1, 1, Handle<&Options::PutPrintComments>},
    };
    return members;
}

void PowerPointPrintOptions::PutPrintColorType(Call& call) {
    using Print = PresentationPrint;
    m_print->colour = OneOf(call, L"PrintColorType",
                            {Print::Color, Print::BlackAndWhite, Print::PureBlackAndWhite});
}

void PowerPointPrintOptions::PutFitToPage(Call& call) {
    m_print->fitToPage = call.Flag(0);
}

void PowerPointPrintOptions::PutFrameSlides(Call& call) {
    m_print->frames = call.Flag(0);
}

void PowerPointPrintOptions::PutOutputType(Call& call) {
    using Print = PresentationPrint;
    m_print->output =
        OneOf(call, L"OutputType",
              {Print::Slides, Print::OneSlideHandouts, Print::TwoSlideHandouts,
               Print::ThreeSlideHandouts, Print::FourSlideHandouts, Print::SixSlideHandouts,
               Print::NineSlideHandouts, Print::NotesPages, Print::Outline});
}

void PowerPointPrintOptions::PutPrintHiddenSlides(Call& call) {
    m_print->hiddenSlides = call.Flag(0);
}

/// The print is done when the call returns, which suits either wish.
void PowerPointPrintOptions::PutPrintInBackground(Call& call) {
    call.Flag(0);
}

void PowerPointPrintOptions::PutActivePrinter(Call& call) {
    const std::wstring printer = call.Text(0);
    RequirePrinter(printer);
    m_print->printer = printer;
}

void PowerPointPrintOptions::PutHandoutOrder(Call& call) {
    m_print->order = OneOf(call, L"HandoutOrder",
                           {PresentationPrint::AcrossFirst, PresentationPrint::DownFirst});
}

void PowerPointPrintOptions::PutPrintComments(Call& call) {
    m_print->comments = call.Flag(0);
}

} // namespace standins
