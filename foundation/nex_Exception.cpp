#include "foundation/nex_Exception.h"

#include "foundation/thr_Poll.h"

#include <string>

namespace {

// One thread works on one deck; a second thread with a deck of its own has its own frames.
thread_local const nex_Context* innermost = nullptr;

} // namespace

QRXBasException::QRXBasException(const atr_String& text) : text_(text), context_(nex_Context::Text()) {}

void nex_Raise(const atr_String& text) {
    QRXBasException::Throw(nex_PrimException<atr_String, 1>(text));
}

nex_Context::nex_Context(const char* kind, const atr_StringBase& name)
    : kind_(kind), name_(&name), outer_(innermost) {
    thr_Poll::Now();
    innermost = this;
}

nex_Context::~nex_Context() {
    innermost = outer_;
}

atr_String nex_Context::Text() {
    std::string text;
    for (const nex_Context* frame = innermost; frame != nullptr; frame = frame->outer_) {
        std::string piece(frame->kind_);
        piece.append(" '").append(frame->name_->View()).append(text.empty() ? "'" : "', ");
        text.insert(0, piece);
    }
    return atr_String(std::string_view(text));
}

void nex_RaiseCastFailure(const char* found, const char* expected, nex_Position position) {
    std::string file(position.file);
    file.erase(0, file.find_last_of('/') + 1);
    const std::string text = std::string("class check failed: found ") + found + ", expected " + expected +
                             " (" + file + ":" + std::to_string(position.line) + ")";
    nex_Raise(atr_String(std::string_view(text)));
}
