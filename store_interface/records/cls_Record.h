#ifndef QRX_STORE_CLS_RECORD_H
#define QRX_STORE_CLS_RECORD_H

#include "foundation/cow_COW.h"
#include "foundation/mem_Allocation.h"

#include <string_view>

class cls_FieldTable;
class cls_WriteVisitor;

/// What a class of records is called, its number and what it is for.
/// A number of 0 stands for one worked out from the name; it never reaches a deck.
struct cls_ClassInfo {
    const char* name;
    const char* doc;
    unsigned number = 0;
    /// Other words that model files take for it beside its short name, with spaces between.
    const char* aliases = "";

    /// The name without its family's prefix, "BeamSection" of "kseC_BeamSection".
    constexpr std::string_view Word() const {
        const std::string_view whole(name);
        return whole.substr(whole.find('_') + 1);
    }

    constexpr unsigned Id() const { return number != 0 ? number : HashOfName(); }

private:
    // 32-bit FNV-1a; the highest bit keeps it apart from the given numbers.
    constexpr unsigned HashOfName() const {
        unsigned hash = 2166136261U;
        for (const char c : std::string_view(name)) {
            hash = (hash ^ static_cast<unsigned char>(c)) * 16777619U;
        }
        return hash | 0x80000000U;
    }
};

/// Root of all attribute records: plain values with a class number. A record class declares its fields once,
/// in Fields(); reading, writing, equality, the schema and the documentation follow from that table.
class cls_Record : public mem_AllocationOperators {
public:
    static constexpr cls_ClassInfo Class{"cls_Record", "root of all records"};

    virtual ~cls_Record() = default;
    /// A full copy on the heap, of the object's own class.
    virtual cls_Record* Copy() const = 0;
    virtual unsigned DynTypeId() const = 0;
    virtual const cls_FieldTable& DynFields() const = 0;
    /// Raises if an invariant of the class doesn't hold.
    virtual void AssertValid() const {}
    /// Shows all fields to the visitor, in order.
    virtual void DBWrite(cls_WriteVisitor& visitor) const;

    static unsigned TypeId() { return Class.Id(); }
    static const cls_FieldTable& Fields();

protected:
    cls_Record() = default;
    cls_Record(const cls_Record&) = default;
    cls_Record(cls_Record&&) = default;
    cls_Record& operator=(const cls_Record&) = default;
    cls_Record& operator=(cls_Record&&) = default;
};

/// Base of the abstract record class T, itself derived from Base. T has a static member
/// `Class` and, if it has fields of its own, a static `Fields()`.
template <class T, class Base = cls_Record>
class cls_AbstractRecordOf : public Base {
public:
    using BaseRecord = Base;
    static unsigned TypeId() { return T::Class.Id(); }
};

/// Base of the record class T, itself derived from Base: identity and copying.
template <class T, class Base = cls_Record>
class cls_RecordOf : public Base {
public:
    using BaseRecord = Base;
    using Base::Base;
    static unsigned TypeId() { return T::Class.Id(); }
    cls_Record* Copy() const override { return new T(static_cast<const T&>(*this)); }
    unsigned DynTypeId() const override { return T::Class.Id(); }
    const cls_FieldTable& DynFields() const override { return T::Fields(); }
};

/// Copy policy of records.
template <class T>
struct cow_Record {
    static T* Copy(const T& record) { return static_cast<T*>(record.Copy()); }
};

/// A record of class T or of a class derived from it, shared until it is written; null when absent.
template <class T>
class mdl_ObjCow : public cow_COW<T, cow_Record<T>> {
public:
    mdl_ObjCow() = default;
    mdl_ObjCow(const T& record) : cow_COW<T, cow_Record<T>>(cow_Record<T>::Copy(record)) {}
    /// Takes over a record from the heap.
    explicit mdl_ObjCow(T* record) : cow_COW<T, cow_Record<T>>(record) {}
};

/// Equality by class and by all fields, reals compared exactly.
bool cls_RecordsEqual(const cls_Record& a, const cls_Record& b);

#endif
