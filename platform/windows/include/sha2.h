#ifndef QRX_PLATFORM_WINDOWS_SHA2_H
#define QRX_PLATFORM_WINDOWS_SHA2_H

#include <cstddef>
#include <cstdint>

// SHA-256, under the names of the library that other systems have for it.

constexpr std::size_t SHA256_DIGEST_LENGTH = 32;

struct SHA2_CTX {
    std::uint32_t state[8];
    std::uint64_t bytes;
    unsigned char block[64];
};

void SHA256Init(SHA2_CTX* context);
void SHA256Update(SHA2_CTX* context, const unsigned char* data, std::size_t bytes);
void SHA256Final(unsigned char* digest, SHA2_CTX* context);

#endif
