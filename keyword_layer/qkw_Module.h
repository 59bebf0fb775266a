#ifndef QRX_KEYWORD_QKW_MODULE_H
#define QRX_KEYWORD_QKW_MODULE_H

/// The keyword layer's start and stop; see qrx_Module.
void QRXZptIfwQkw_initialize(int& count);
void QRXZptIfwQkw_finalize(int& count);

#endif
