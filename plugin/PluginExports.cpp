#include "common/CatchAll.h"
#include "office/AutomationScope.h"
#include "plugin/MSOfficePluginImpl.h"
#include "plugin/PluginIdentity.h"
#include "plugin/interface/WQPlugin.h"

#include <objbase.h>

#include <memory>
#include <utility>

namespace {

/// There while the module is initialised.
std::unique_ptr<char> g_moduleToken;
bool g_comInitialised = false;

} // namespace

void InitializePlugin() {
    CatchAll([] {
        if (g_moduleToken)
            return;
        auto token = std::make_unique<char>();
        g_comInitialised = InitializeMfcAndCom();
        g_moduleToken = std::move(token);
    });
}

void UninitializePlugin() {
    CatchAll([] {
        const std::unique_ptr<char> token = std::move(g_moduleToken);
        if (token && g_comInitialised)
            CoUninitialize();
    });
}

void GetPluginInfo(PluginInfo* info) {
    CatchAll([info] {
        info->kind = PluginIdentity::Kind;
        info->version = PluginIdentity::Version;
        info->identifier = PluginIdentity::Identifier;
        info->vendor = PluginIdentity::Vendor;
        // The four-letter extensions are not announced; screening takes them all the same.
        for (const char* extension : {"doc", "xls", "ppt", "pps", "pub"})
            info->extensions.Add(extension);
    });
}

WQPlugin* GetPluginInstance(void* /*context*/) {
    return CatchAll<WQPlugin*>(nullptr,
                               [] { return std::make_unique<MSOfficePluginImpl>().release(); });
}

void ReleasePluginInstance(WQPlugin* plugin) {
    CatchAll([plugin] { const std::unique_ptr<WQPlugin> released(plugin); });
}
