#include "standins/office/host/HostedOffice.h"

#include "standins/office/host/EventLoop.h"

#include <LibreOfficeKit/LibreOfficeKitInit.h>
#include <unistd.h>

#include <com/sun/star/beans/PropertyValue.hpp>
#include <com/sun/star/container/XNameReplace.hpp>
#include <com/sun/star/lang/XMultiServiceFactory.hpp>
#include <com/sun/star/util/XChangesBatch.hpp>
#include <cstdlib>

using rtl::OUString;

namespace standins {

namespace {

constexpr const char* OwnProfile = "file:///proc/self/cwd/profile";

/// Functions of LibreOffice's own libraries, which no interface promises.
struct Internals {
    css::uno::Reference<css::uno::XComponentContext> (*context)() = nullptr;
    void (*setActiveKit)(bool) = nullptr;

    bool AreThere() const { return context && setActiveKit; }
};

Internals g_internals;

/// From then on everybody here finds the names of the library that has them.
/// @param program LibreOffice's program folder, whose libraries are loaded
Internals FindInternals(const std::string& program) {
    Internals found;
    for (const char* name : {"/libmergedlo.so", "/libcomphelper.so"}) {
        void* const library =
            dlopen((program + name).c_str(), RTLD_NOW | RTLD_NOLOAD | RTLD_GLOBAL);
        if (!library)
            continue;
        found.context = reinterpret_cast<decltype(found.context)>(
            dlsym(library, "_ZN10comphelper26getProcessComponentContextEv"));
        found.setActiveKit = reinterpret_cast<decltype(found.setActiveKit)>(
            dlsym(library, "_ZN10comphelper14LibreOfficeKit9setActiveEb"));
        if (found.AreThere())
            break;
    }
    return found;
}

/// Sets a text in LibreOffice's settings.
void SetText(const char* node, const char* name) {
    using namespace css;
    const auto context = g_internals.context();
    const uno::Reference<lang::XMultiServiceFactory> provider(
        context->getServiceManager()->createInstanceWithContext(
            "com.sun.star.configuration.ConfigurationProvider", context),
        uno::UNO_QUERY_THROW);
    beans::PropertyValue path;
    path.Name = "nodepath";
    path.Value <<= OUString::createFromAscii(node);
    const uno::Any argument(path);
    const uno::Reference<container::XNameReplace> settings(
        provider->createInstanceWithArguments(
            "com.sun.star.configuration.ConfigurationUpdateAccess", {&argument, 1}),
        uno::UNO_QUERY_THROW);
    settings->replaceByName(OUString::createFromAscii(name), uno::Any(OUString()));
    uno::Reference<util::XChangesBatch>(settings, uno::UNO_QUERY_THROW)->commitChanges();
}

/// The kit makes the locale American, and with it the paper Letter. Empty texts stand for the
/// locale of the environment.
void BehaveAsFromACommandLine() {
    g_internals.setActiveKit(false);
    SetText("/org.openoffice.Setup/L10N", "ooSetupSystemLocale");
    SetText("/org.openoffice.Setup/L10N", "ooLocale");
    SetText("/org.openoffice.Office.Linguistic/General", "UILocale");
}

void SetEnvironment() {
    // One thread, whose loop is the kit's caller's: what has a second one cannot be forked.
    setenv("SAL_LOK_OPTIONS", "unipoll", 1);
    setenv("UserInstallation", OwnProfile, 1);
    setenv("UNO_SHARED_PACKAGES_CACHE", (std::string(OwnProfile) + "/shared").c_str(), 1);
    setenv("TMPDIR", "/proc/self/cwd", 1);
}

} // namespace

std::string HostedOffice::Run(const std::string& program, const std::function<void()>& serve) {
    SetEnvironment();
    LibreOfficeKit* const kit = lok_init_2(program.c_str(), OwnProfile);
    if (!kit)
        return "LibreOffice cannot be started as a library";
    g_internals = FindInternals(program);
    if (!LIBREOFFICEKIT_HAS(kit, runLoop) || !g_internals.AreThere())
        return "this LibreOffice lacks what is needed to keep it started";
    EventLoop loop([&serve] {
        try {
            BehaveAsFromACommandLine();
        } catch (const css::uno::Exception&) { // there is no way out through LibreOffice
            _exit(EXIT_FAILURE);
        }
        serve();
    });
    kit->pClass->runLoop(kit, EventLoop::Poll, EventLoop::Wake, &loop);
    return "LibreOffice does not stay started";
}

css::uno::Reference<css::uno::XComponentContext> HostedOffice::Context() {
    return g_internals.context();
}

} // namespace standins
