#ifndef QRX_QRXZPTINPUTFILEWRITER_H
#define QRX_QRXZPTINPUTFILEWRITER_H

/// Start and stop of the library, counted: the first start starts the store's modules, the base modules, the
/// keyword layer and the deck writer, the last stop ends the two layers and then the modules in the opposite
/// order. Each module that starts adds 1 to the argument, each that ends takes 1 off; further calls leave it
/// alone. Writing a deck does not depend on them.
void QRXZptInputFileWriter_initialize(int& count);
void QRXZptInputFileWriter_finalize(int& count);

/// The deck writer layer alone.
void QRXZptIfwOif_initialize(int& count);
void QRXZptIfwOif_finalize(int& count);

#endif
