#ifndef QRX_TESTS_FOUNDATION_RAISEDTEXT_H
#define QRX_TESTS_FOUNDATION_RAISEDTEXT_H

#include "foundation/nex_Exception.h"

#include <string>

/// The text that `action` raises; "(nothing raised)" if it returns.
template <class Action>
std::string RaisedText(Action action) {
    try {
        action();
    } catch (const nex_PrimException<atr_String, 1>& failure) {
        return failure.what();
    }
    return "(nothing raised)";
}

#endif
