#pragma once

/// Sends what the system layer reports (see its LogSink.h) to the log, as warnings.
void RouteLayerLog();
