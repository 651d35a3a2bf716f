#include "host/program/system/Digest.h"

#include <windows.h>

#include <bcrypt.h>

#include <array>

namespace {

/// What makes SHA-256; for all, as long as the program runs.
BCRYPT_ALG_HANDLE Algorithm() {
    static const BCRYPT_ALG_HANDLE s_algorithm = [] {
        BCRYPT_ALG_HANDLE algorithm = nullptr;
        BCryptOpenAlgorithmProvider(&algorithm, BCRYPT_SHA256_ALGORITHM, nullptr, 0);
        return algorithm;
    }();
    return s_algorithm;
}

} // namespace

Digest::Digest() {
    BCRYPT_HASH_HANDLE hash = nullptr;
    if (BCryptCreateHash(Algorithm(), &hash, nullptr, 0, nullptr, 0, 0) >= 0)
        m_hash = std::shared_ptr<void>(hash, BCryptDestroyHash);
}

void Digest::Add(const char* data, std::size_t size) {
    BCryptHashData(m_hash.get(), reinterpret_cast<PUCHAR>(const_cast<char*>(data)),
                   static_cast<ULONG>(size), 0);
}

std::string Digest::Text() {
    std::array<unsigned char, 32> bytes{};
    if (BCryptFinishHash(m_hash.get(), bytes.data(), static_cast<ULONG>(bytes.size()), 0) < 0)
        return {};
    std::string text;
    for (const unsigned char each : bytes) {
        constexpr const char* Digits = "0123456789abcdef";
        text += Digits[each >> 4];
        text += Digits[each & 15];
    }
    return text;
}
