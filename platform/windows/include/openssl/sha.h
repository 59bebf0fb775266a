#ifndef QRX_PLATFORM_WINDOWS_OPENSSL_SHA_H
#define QRX_PLATFORM_WINDOWS_OPENSSL_SHA_H

#include <cstddef>
#include <cstdint>

// SHA-256, under the names of the library that other systems have for it.

constexpr std::size_t SHA256_DIGEST_LENGTH = 32;

struct SHA256_CTX {
    std::uint32_t state[8];
    std::uint64_t bytes;
    unsigned char block[64];
};

void SHA256_Init(SHA256_CTX* context);
void SHA256_Update(SHA256_CTX* context, const void* data, std::size_t bytes);
void SHA256_Final(unsigned char* digest, SHA256_CTX* context);

#endif
