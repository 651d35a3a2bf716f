#pragma once

/// Sends what wxWidgets reports, failed assertions included, to the log for the rest of the
/// process's life.
void RouteToolkitLog();

/// Sends what the system layer reports (see its LogSink.h) to the log, as warnings.
void RouteLayerLog();
