#include "standins/office/server/powerpoint/PowerPointPresentations.h"

#include "standins/office/server/powerpoint/PowerPointPresentation.h"

namespace standins {

namespace {

const std::vector<DocumentFormat> Formats = {
    {"ppt", "MS PowerPoint 97", SlidesExport, HiddenSlidesExport},
    {"pps", "MS PowerPoint 97 AutoPlay", SlidesExport, HiddenSlidesExport},
    {"pptx", "Impress MS PowerPoint 2007 XML", SlidesExport, HiddenSlidesExport},
    {"ppsx", "Impress MS PowerPoint 2007 XML AutoPlay", SlidesExport, HiddenSlidesExport},
};

constexpr UINT OpenFileName = 0; // the others have no bearing: nothing is changed or shown

} // namespace

const std::vector<Member>& PowerPointPresentations::Members() const {
    static const std::vector<Member> members = {
        {2004, DISPATCH_METHOD, L"Open", 1, 4, Handle<&PowerPointPresentations::Open>},
    };
    return members;
}

void PowerPointPresentations::Open(Call& call) {
    call.Return(MakeObject<PowerPointPresentation>(
        TheSession(), OpenedDocument(call.Text(OpenFileName), Formats)));
}

} // namespace standins
