#include "deck/QRXZptInputFileWriter.h"

#include "foundation/qrx_Module.h"
#include "keyword_layer/qkw_Module.h"
#include "store_interface/model/odb_Modules.h"

#include <iterator>

namespace {

qrx_Module theWriter;
qrx_Module theDeckWriterLayer;

using Step = void (*)(int&);
struct Pair {
    Step initialize;
    Step finalize;
};

constexpr Pair kLibraries[] = {
    {StoreOdbBridge_initialize, StoreOdbBridge_finalize},
    {StoreOdbApi_initialize, StoreOdbApi_finalize},
    {StoreCore_initialize, StoreCore_finalize},
    {StoreAttributes_initialize, StoreAttributes_finalize},
    {StoreGeometry_initialize, StoreGeometry_finalize},
    {StoreDiagnostics_initialize, StoreDiagnostics_finalize},
    {StoreResultsInterface_initialize, StoreResultsInterface_finalize},
    {BaseGeometry_initialize, BaseGeometry_finalize},
    {BaseUtilities_initialize, BaseUtilities_finalize},
    {BaseShared_initialize, BaseShared_finalize},
    {BaseCoreUtilities_initialize, BaseCoreUtilities_finalize},
    {BaseAlloc_initialize, BaseAlloc_finalize},
};

} // namespace

void QRXZptIfwOif_initialize(int& count) {
    theDeckWriterLayer.Initialize(count);
}

void QRXZptIfwOif_finalize(int& count) {
    theDeckWriterLayer.Finalize(count);
}

void QRXZptInputFileWriter_initialize(int& count) {
    if (theWriter.IsIdle()) {
        for (const Pair& library : kLibraries) library.initialize(count);
        QRXZptIfwQkw_initialize(count);
        QRXZptIfwOif_initialize(count);
    }
    theWriter.Initialize(count);
}

void QRXZptInputFileWriter_finalize(int& count) {
    if (theWriter.HasOneUser()) {
        // The two layers go in the order in which they came, the libraries in the opposite one.
        QRXZptIfwQkw_finalize(count);
        QRXZptIfwOif_finalize(count);
        for (auto library = std::rbegin(kLibraries); library != std::rend(kLibraries); ++library) {
            library->finalize(count);
        }
    }
    theWriter.Finalize(count);
}
