#include "store_interface/model/odb_Modules.h"

#include "foundation/qrx_Module.h"

namespace {

qrx_Module theStoreOdbBridge;
qrx_Module theStoreOdbApi;
qrx_Module theStoreCore;
qrx_Module theStoreAttributes;
qrx_Module theStoreGeometry;
qrx_Module theStoreDiagnostics;
qrx_Module theStoreResultsInterface;

} // namespace

void StoreOdbBridge_initialize(int& count) {
    theStoreOdbBridge.Initialize(count);
}

void StoreOdbBridge_finalize(int& count) {
    theStoreOdbBridge.Finalize(count);
}

void StoreOdbApi_initialize(int& count) {
    theStoreOdbApi.Initialize(count);
}

void StoreOdbApi_finalize(int& count) {
    theStoreOdbApi.Finalize(count);
}

void StoreCore_initialize(int& count) {
    theStoreCore.Initialize(count);
}

void StoreCore_finalize(int& count) {
    theStoreCore.Finalize(count);
}

void StoreAttributes_initialize(int& count) {
    theStoreAttributes.Initialize(count);
}

void StoreAttributes_finalize(int& count) {
    theStoreAttributes.Finalize(count);
}

void StoreGeometry_initialize(int& count) {
    theStoreGeometry.Initialize(count);
}

void StoreGeometry_finalize(int& count) {
    theStoreGeometry.Finalize(count);
}

void StoreDiagnostics_initialize(int& count) {
    theStoreDiagnostics.Initialize(count);
}

void StoreDiagnostics_finalize(int& count) {
    theStoreDiagnostics.Finalize(count);
}

void StoreResultsInterface_initialize(int& count) {
    theStoreResultsInterface.Initialize(count);
}

void StoreResultsInterface_finalize(int& count) {
    theStoreResultsInterface.Finalize(count);
}
