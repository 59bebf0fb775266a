#include "study/sty_Sha256.h"

#include "study/sty_File.h"

#include <cstring>
#include <openssl/sha.h>

namespace {

static_assert(sizeof(SHA256_CTX) <= 112);

template <class Action>
void WithContext(std::array<unsigned char, 112>& bytes, const Action& action) {
    SHA256_CTX context;
    std::memcpy(&context, bytes.data(), sizeof context);
    action(context);
    std::memcpy(bytes.data(), &context, sizeof context);
}

} // namespace

sty_Sha256::sty_Sha256() : context_{} {
    WithContext(context_, [](SHA256_CTX& context) { SHA256_Init(&context); });
}

void sty_Sha256::Add(std::string_view text) {
    WithContext(context_, [&](SHA256_CTX& context) { SHA256_Update(&context, text.data(), text.size()); });
}

std::string sty_Sha256::Hex() const {
    std::array<unsigned char, kBytes> copy = context_;
    unsigned char digest[SHA256_DIGEST_LENGTH];
    WithContext(copy, [&](SHA256_CTX& context) { SHA256_Final(digest, &context); });
    constexpr char digits[] = "0123456789abcdef";
    std::string hex;
    for (const unsigned char byte : digest) {
        hex += digits[byte >> 4];
        hex += digits[byte & 15];
    }
    return hex;
}

std::string sty_Sha256OfFile(const std::string& path) {
    sty_File file(path);
    sty_Sha256 sum;
    for (;;) {
        const std::string_view piece = file.Next();
        if (piece.empty()) break;
        sum.Add(piece);
    }
    return file.Error() != 0 ? std::string() : sum.Hex();
}
