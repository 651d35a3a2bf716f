#include "host/program/system/Digest.h"

#include <glib.h>

namespace {

GChecksum* Of(const std::shared_ptr<void>& hash) {
    return static_cast<GChecksum*>(hash.get());
}

} // namespace

Digest::Digest()
    : m_hash(g_checksum_new(G_CHECKSUM_SHA256),
             [](void* hash) { g_checksum_free(static_cast<GChecksum*>(hash)); }) {}

void Digest::Add(const char* data, std::size_t size) {
    g_checksum_update(Of(m_hash), reinterpret_cast<const guchar*>(data), static_cast<gssize>(size));
}

std::string Digest::Text() {
    return g_checksum_get_string(Of(m_hash));
}
