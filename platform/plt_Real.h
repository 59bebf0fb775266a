#ifndef QRX_PLATFORM_PLT_REAL_H
#define QRX_PLATFORM_PLT_REAL_H

/// strtod in the "C" locale, for standard libraries that read no reals themselves.
double plt_ReadPlainReal(const char* text);

#endif
