#include "platform/windows/include/openssl/sha.h"

#include <algorithm>
#include <array>
#include <bit>
#include <cstring>

namespace {

constexpr std::array<std::uint32_t, 64> kRoundConstants = {
    0x428a2f98, 0x71374491, 0xb5c0fbcf, 0xe9b5dba5, 0x3956c25b, 0x59f111f1, 0x923f82a4, 0xab1c5ed5,
    0xd807aa98, 0x12835b01, 0x243185be, 0x550c7dc3, 0x72be5d74, 0x80deb1fe, 0x9bdc06a7, 0xc19bf174,
    0xe49b69c1, 0xefbe4786, 0x0fc19dc6, 0x240ca1cc, 0x2de92c6f, 0x4a7484aa, 0x5cb0a9dc, 0x76f988da,
    0x983e5152, 0xa831c66d, 0xb00327c8, 0xbf597fc7, 0xc6e00bf3, 0xd5a79147, 0x06ca6351, 0x14292967,
    0x27b70a85, 0x2e1b2138, 0x4d2c6dfc, 0x53380d13, 0x650a7354, 0x766a0abb, 0x81c2c92e, 0x92722c85,
    0xa2bfe8a1, 0xa81a664b, 0xc24b8b70, 0xc76c51a3, 0xd192e819, 0xd6990624, 0xf40e3585, 0x106aa070,
    0x19a4c116, 0x1e376c08, 0x2748774c, 0x34b0bcb5, 0x391c0cb3, 0x4ed8aa4a, 0x5b9cca4f, 0x682e6ff3,
    0x748f82ee, 0x78a5636f, 0x84c87814, 0x8cc70208, 0x90befffa, 0xa4506ceb, 0xbef9a3f7, 0xc67178f2};

void Take(std::uint32_t (&state)[8], const unsigned char* block) {
    std::uint32_t w[64];
    for (int i = 0; i < 16; ++i) {
        w[i] = std::uint32_t{block[4 * i]} << 24 | std::uint32_t{block[4 * i + 1]} << 16 |
               std::uint32_t{block[4 * i + 2]} << 8 | std::uint32_t{block[4 * i + 3]};
    }
    for (int i = 16; i < 64; ++i) {
        const std::uint32_t a = w[i - 15];
        const std::uint32_t b = w[i - 2];
        w[i] = w[i - 16] + (std::rotr(a, 7) ^ std::rotr(a, 18) ^ a >> 3) + w[i - 7] +
               (std::rotr(b, 17) ^ std::rotr(b, 19) ^ b >> 10);
    }
    std::uint32_t s[8];
    std::copy_n(state, 8, s);
    for (std::size_t i = 0; i < 64; ++i) {
        const std::uint32_t e = s[4];
        const std::uint32_t a = s[0];
        const std::uint32_t first = s[7] + (std::rotr(e, 6) ^ std::rotr(e, 11) ^ std::rotr(e, 25)) +
                                    ((e & s[5]) ^ (~e & s[6])) + kRoundConstants[i] + w[i];
        const std::uint32_t second = (std::rotr(a, 2) ^ std::rotr(a, 13) ^ std::rotr(a, 22)) +
                                     ((a & s[1]) ^ (a & s[2]) ^ (s[1] & s[2]));
        std::copy_backward(s, s + 7, s + 8);
        s[4] += first;
        s[0] = first + second;
    }
    for (int i = 0; i < 8; ++i) state[i] += s[i];
}

} // namespace

void SHA256_Init(SHA256_CTX* context) {
    *context = {
        {0x6a09e667, 0xbb67ae85, 0x3c6ef372, 0xa54ff53a, 0x510e527f, 0x9b05688c, 0x1f83d9ab, 0x5be0cd19},
        0,
        {}};
}

void SHA256_Update(SHA256_CTX* context, const void* text, std::size_t bytes) {
    const auto* data = static_cast<const unsigned char*>(text);
    while (bytes > 0) {
        const std::size_t held = context->bytes % 64;
        const std::size_t step = std::min(bytes, 64 - held);
        std::memcpy(context->block + held, data, step);
        context->bytes += step;
        data += step;
        bytes -= step;
        if (held + step == 64) Take(context->state, context->block);
    }
}

void SHA256_Final(unsigned char* digest, SHA256_CTX* context) {
    const std::uint64_t bits = 8 * context->bytes;
    const unsigned char one = 0x80;
    const unsigned char zero = 0;
    SHA256_Update(context, &one, 1);
    while (context->bytes % 64 != 56) SHA256_Update(context, &zero, 1);
    unsigned char length[8];
    for (int i = 0; i < 8; ++i) length[i] = static_cast<unsigned char>(bits >> (56 - 8 * i));
    SHA256_Update(context, length, 8);
    for (int i = 0; i < 32; ++i)
        digest[i] = static_cast<unsigned char>(context->state[i / 4] >> (24 - 8 * (i % 4)));
}
