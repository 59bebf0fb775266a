#ifndef QRX_MODEL_FILE_MDF_UTF8_H
#define QRX_MODEL_FILE_MDF_UTF8_H

#include <cstddef>
#include <string>
#include <string_view>

/// Bytes of the UTF-8 character that the text begins with; 0 when it begins with none.
std::size_t mdf_Utf8Length(std::string_view text);
/// The longest beginning of at most `most` bytes that cuts no character; a byte that is no character counts
/// as one.
std::string_view mdf_Utf8Beginning(std::string_view text, std::size_t most);
/// The longest end of at most `most` bytes that begins with no byte from the middle of a character.
std::string_view mdf_Utf8End(std::string_view text, std::size_t most);
/// Two hexadecimal digits.
std::string mdf_HexOf(unsigned char byte);

#endif
