#include "foundation/qrx_Module.h"

namespace {

qrx_Module theBaseGeometry;
qrx_Module theBaseUtilities;
qrx_Module theBaseShared;
qrx_Module theBaseCoreUtilities;
qrx_Module theBaseAlloc;

} // namespace

void BaseGeometry_initialize(int& count) {
    theBaseGeometry.Initialize(count);
}

void BaseGeometry_finalize(int& count) {
    theBaseGeometry.Finalize(count);
}

void BaseUtilities_initialize(int& count) {
    theBaseUtilities.Initialize(count);
}

void BaseUtilities_finalize(int& count) {
    theBaseUtilities.Finalize(count);
}

void BaseShared_initialize(int& count) {
    theBaseShared.Initialize(count);
}

void BaseShared_finalize(int& count) {
    theBaseShared.Finalize(count);
}

void BaseCoreUtilities_initialize(int& count) {
    theBaseCoreUtilities.Initialize(count);
}

void BaseCoreUtilities_finalize(int& count) {
    theBaseCoreUtilities.Finalize(count);
}

void BaseAlloc_initialize(int& count) {
    theBaseAlloc.Initialize(count);
}

void BaseAlloc_finalize(int& count) {
    theBaseAlloc.Finalize(count);
}
