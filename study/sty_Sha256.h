#ifndef QRX_STY_SHA256_H
#define QRX_STY_SHA256_H

#include <array>
#include <cstddef>
#include <string>
#include <string_view>

/// The SHA-256 of text that comes piece by piece. A copy goes on from where the original stood.
class sty_Sha256 {
public:
    sty_Sha256();
    void Add(std::string_view text);
    /// Of all that came so far; more may follow.
    std::string Hex() const;

private:
    // The library's context; its header is not for everybody.
    static constexpr std::size_t kBytes = 112;
    alignas(8) std::array<unsigned char, kBytes> context_;
};

/// Of a whole file; empty when it can't be read.
std::string sty_Sha256OfFile(const std::string& path);

#endif
