#ifndef QRX_STORE_ODB_MODULES_H
#define QRX_STORE_ODB_MODULES_H

// The modules of the store; see qrx_Module for what the functions do.
void StoreOdbBridge_initialize(int& count);
void StoreOdbBridge_finalize(int& count);
void StoreOdbApi_initialize(int& count);
void StoreOdbApi_finalize(int& count);
void StoreCore_initialize(int& count);
void StoreCore_finalize(int& count);
void StoreAttributes_initialize(int& count);
void StoreAttributes_finalize(int& count);
void StoreGeometry_initialize(int& count);
void StoreGeometry_finalize(int& count);
void StoreDiagnostics_initialize(int& count);
void StoreDiagnostics_finalize(int& count);
void StoreResultsInterface_initialize(int& count);
void StoreResultsInterface_finalize(int& count);

#endif
