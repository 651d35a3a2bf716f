#pragma once

#include <glib-object.h>

#include <memory>

namespace standins {

struct GObjectDeleter {
    void operator()(gpointer object) const { g_object_unref(object); }
};

/// A reference of GObject's, given back with it.
template <typename Object>
using GObjectReference = std::unique_ptr<Object, GObjectDeleter>;

} // namespace standins
