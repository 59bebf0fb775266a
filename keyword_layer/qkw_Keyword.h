#ifndef QRX_KEYWORD_QKW_KEYWORD_H
#define QRX_KEYWORD_QKW_KEYWORD_H

#include "foundation/cow_COW.h"
#include "foundation/cow_List.h"
#include "foundation/utl_Stream.h"

/// One item of the deck: a keyword with its parameters and data lines, or a comment. Its constructor decides
/// what to say; from then on it never changes, holds its own values or counted shares of store objects, and
/// knows no builder.
class qkw_Keyword : public mem_AllocationOperators {
public:
    virtual ~qkw_Keyword() = default;
    /// A full copy on the heap.
    virtual qkw_Keyword* Copy() const = 0;
    /// Writes the whole text; its last line is ended, unless the class says otherwise.
    virtual void Write(utl_Stream& stream) const = 0;
    /// Whether there is nothing to say, so that a builder needn't keep it. Most classes always have
    /// something.
    virtual bool IsEmpty() const { return false; }

protected:
    qkw_Keyword() = default;
    qkw_Keyword(const qkw_Keyword&) = default;
    qkw_Keyword(qkw_Keyword&&) = default;
    qkw_Keyword& operator=(const qkw_Keyword&) = default;
    qkw_Keyword& operator=(qkw_Keyword&&) = default;
};

/// Base of the keyword class T, itself derived from Base: gives Copy().
template <class T, class Base = qkw_Keyword>
class qkw_KeywordOf : public Base {
public:
    using Base::Base;
    qkw_Keyword* Copy() const override { return new T(static_cast<const T&>(*this)); }
};

/// Made from a keyword, it holds a copy of it.
using qkw_KeywordHandle = cow_ArrayCOW<qkw_Keyword, cow_Virtual<qkw_Keyword>>;
using qkw_KeywordList = cow_List<qkw_KeywordHandle>;

#endif
