#ifndef QRX_FOUNDATION_COW_COW_H
#define QRX_FOUNDATION_COW_COW_H

#include "foundation/cow_CountedHld.h"

/// Copy policy for polymorphic objects: their virtual Copy().
template <class T>
struct cow_Virtual {
    static T* Copy(const T& object) { return object.Copy(); }
};

/// Copy policy for plain classes: the copy constructor.
template <class T>
struct cow_Direct {
    static T* Copy(const T& object) { return new T(object); }
};

/// A counted handle whose holders share the object until one of them asks for it with Get().
template <class T, class Policy>
class cow_COW : public cow_CountedHld<T> {
public:
    using cow_CountedHld<T>::cow_CountedHld;

    const T& ConstGet() const { return *this->Referent(); }
    /// The object for writing: this handle's own, copied first if it is shared.
    T& Get() {
        if (this->HolderCount() > 1) this->Reset(Policy::Copy(ConstGet()));
        return *this->Referent();
    }
};

/// The handle form that goes into lists: made from an object, it stores a copy of it.
template <class T, class Policy>
class cow_ArrayCOW : public cow_COW<T, Policy> {
public:
    cow_ArrayCOW() = default;
    cow_ArrayCOW(const T& object) : cow_COW<T, Policy>(Policy::Copy(object)) {}
};

#endif
