#include "platform/plt_Real.h"

#include <clocale>
#include <cstdlib>

double plt_ReadPlainReal(const char* text) {
    static const locale_t plain = ::newlocale(LC_ALL_MASK, "C", nullptr);
    return ::strtod_l(text, nullptr, plain);
}
