#include "keyword_layer/qkw_Module.h"

#include "foundation/qrx_Module.h"

namespace {

qrx_Module theKeywordLayer;

} // namespace

void QRXZptIfwQkw_initialize(int& count) {
    theKeywordLayer.Initialize(count);
}

void QRXZptIfwQkw_finalize(int& count) {
    theKeywordLayer.Finalize(count);
}
