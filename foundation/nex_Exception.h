#ifndef QRX_FOUNDATION_NEX_EXCEPTION_H
#define QRX_FOUNDATION_NEX_EXCEPTION_H

#include "foundation/atr_String.h"

#include <exception>

/// Root of everything that the system raises on purpose.
/// what() is the text exactly as it was given; Context() names the object (and the step) that was being
/// worked on when the exception was raised, or is empty.
class QRXBasException : public std::exception {
public:
    explicit QRXBasException(const atr_String& text);
    const char* what() const noexcept override { return text_.CStr(); }
    const char* Context() const noexcept { return context_.CStr(); }

    /// Raises a copy of `failure`, with the context of this moment.
    template <class Failure>
    [[noreturn]] static void Throw(const Failure& failure) {
        throw Failure(failure);
    }

private:
    atr_String text_;
    atr_String context_;
};

/// An exception that carries N primitive values; the system uses it with one text.
template <class T, int N>
class nex_PrimException;

template <>
class nex_PrimException<atr_String, 1> : public QRXBasException {
public:
    using QRXBasException::QRXBasException;
};

/// Raises nex_PrimException<atr_String, 1> with the text.
[[noreturn]] void nex_Raise(const atr_String& text);

/// A frame of the context that an exception carries: what is being worked on, such as kind "load" and the
/// load's name. Frames nest; making one costs two pointers, the text is made only when something is raised.
/// `kind` and `name` must outlive the frame.
class nex_Context {
public:
    nex_Context(const char* kind, const atr_StringBase& name);
    nex_Context(const nex_Context&) = delete;
    nex_Context& operator=(const nex_Context&) = delete;
    ~nex_Context();

    /// The frames of this thread, outermost first: "step 'Load', load 'P1'"; empty without a frame.
    static atr_String Text();

private:
    const char* kind_;
    const atr_StringBase* name_;
    const nex_Context* outer_;
};

/// A source position for failures of class checks.
struct nex_Position {
    const char* file;
    int line;
};
#define NEX_HERE                                                                                             \
    nex_Position {                                                                                           \
        __FILE__, __LINE__                                                                                   \
    }

/// Raises the failure of a class check: what was found, what was expected, and the source position.
[[noreturn]] void nex_RaiseCastFailure(const char* found, const char* expected, nex_Position position);

#endif
