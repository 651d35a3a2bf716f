#include "standins/office/host/LoadedDocument.h"

#include "standins/office/host/HostedOffice.h"

#include <com/sun/star/beans/PropertyValue.hpp>
#include <com/sun/star/beans/XPropertySet.hpp>
#include <com/sun/star/document/MacroExecMode.hpp>
#include <com/sun/star/drawing/XDrawPagesSupplier.hpp>
#include <com/sun/star/frame/XComponentLoader.hpp>
#include <com/sun/star/frame/XStorable.hpp>
#include <cstdio>
#include <osl/file.hxx>
#include <vector>

using namespace css;
using rtl::OUString;

namespace standins {

namespace {

OUString ToText(const std::string& utf8) {
    return OUString::fromUtf8(rtl::OString(utf8.data(), static_cast<sal_Int32>(utf8.size())));
}

OUString UrlOf(const std::string& path) {
    OUString url;
    osl::FileBase::getFileURLFromSystemPath(ToText(path), url);
    return url;
}

/// Arguments by their names.
class Arguments {
public:
    template <typename Value>
    Arguments& Add(const char* name, const Value& value) {
        beans::PropertyValue argument;
        argument.Name = OUString::createFromAscii(name);
        argument.Value <<= value;
        m_arguments.push_back(argument);
        return *this;
    }
    uno::Sequence<beans::PropertyValue> All() const {
        return {m_arguments.data(), static_cast<sal_Int32>(m_arguments.size())};
    }

private:
    std::vector<beans::PropertyValue> m_arguments;
};

void Tell(const char* what, const uno::Exception& error) {
    std::fprintf(stderr, "%s: %s\n", what,
                 rtl::OUStringToOString(error.Message, RTL_TEXTENCODING_UTF8).getStr());
}

uno::Reference<lang::XComponent> Load(const OUString& url, const OUString& importFilter) {
    const auto context = HostedOffice::Context();
    const uno::Reference<frame::XComponentLoader> desktop(
        context->getServiceManager()->createInstanceWithContext("com.sun.star.frame.Desktop",
                                                                context),
        uno::UNO_QUERY_THROW);
    Arguments arguments;
    arguments.Add("Referer", OUString("private:OpenEvent"))
        .Add("ReadOnly", true)
        .Add("OpenNewView", true)
        .Add("Hidden", true)
        .Add("Silent", true)
        .Add("MacroExecutionMode", document::MacroExecMode::NEVER_EXECUTE)
        .Add("FilterName", importFilter);
    return desktop->loadComponentFromURL(url, "_blank", 0, arguments.All());
}

} // namespace

LoadedDocument::LoadedDocument(const std::string& path, const std::string& importFilter) {
    try {
        m_document = Load(UrlOf(path), ToText(importFilter));
        if (!m_document.is())
            std::fputs("Error: source file could not be loaded\n", stderr);
    } catch (const uno::Exception& error) {
        Tell("Error: source file could not be loaded", error);
    }
}

bool LoadedDocument::HasHiddenSlides() const {
    const uno::Reference<drawing::XDrawPagesSupplier> presentation(m_document, uno::UNO_QUERY);
    if (!presentation.is())
        return false;
    try {
        const auto slides = presentation->getDrawPages();
        for (sal_Int32 number = 0; number < slides->getCount(); ++number) {
            const uno::Reference<beans::XPropertySet> slide(slides->getByIndex(number),
                                                            uno::UNO_QUERY_THROW);
            bool isShown = true;
            slide->getPropertyValue("Visible") >>= isShown;
            if (!isShown)
                return true;
        }
        return false;
    } catch (const uno::Exception&) { // then it is as if there were some
        return true;
    }
}

void LoadedDocument::Export(const std::string& exportTo, const std::string& path) const {
    const std::size_t filter = exportTo.find(':') + 1;
    const std::size_t end = exportTo.find(':', filter);
    Arguments arguments;
    arguments.Add("FilterName", ToText(exportTo.substr(filter, end - filter)));
    if (end != std::string::npos)
        arguments.Add("FilterOptions", ToText(exportTo.substr(end + 1)));
    try {
        const uno::Reference<frame::XStorable> document(m_document, uno::UNO_QUERY_THROW);
        document->storeToURL(UrlOf(path), arguments.All());
    } catch (const uno::Exception& error) {
        Tell("Error: the document could not be exported", error);
    }
}

} // namespace standins
