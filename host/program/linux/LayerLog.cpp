#include "common/WQServices.h"
#include "host/program/system/LogRoutes.h"
#include "platform/win32/base/LogSink.h"

void RouteLayerLog() {
    win32::SetLogSink([](const std::string& record) {
        SetLevelAndGetLogger(LevelWarning, "win32", "system", 0) << record.c_str();
    });
}
