#ifndef QRX_WHOLE_FILE_WHF_WRITEALL_H
#define QRX_WHOLE_FILE_WHF_WRITEALL_H

#include <string_view>

/// Writes all of the text to an open file, through interruptions; 0, or the number of the error.
int whf_WriteAll(int file, std::string_view text) noexcept;

#endif
