#ifndef QRX_STORE_CLS_CLASSREGISTRAR_H
#define QRX_STORE_CLS_CLASSREGISTRAR_H

#include "foundation/nex_Exception.h"
#include "foundation/omi_Singleton.h"
#include "store_interface/records/cls_FieldTable.h"

#include <unordered_map>
#include <vector>

/// What the store knows of one class.
struct cls_ClassEntry {
    cls_ClassInfo info;
    unsigned baseId;
    bool abstract;
    /// A new default record of the class; null for abstract classes and for views.
    cls_Record* (*create)();
    /// The fields; null for views.
    const cls_FieldTable& (*fields)();
};

/// All classes of the store, by number and name.
class cls_ClassRegistrar {
public:
    /// Enters the record class T. A second class of the same number or name raises.
    template <class T>
    void Add() {
        cls_Record* (*create)() = nullptr;
        if constexpr (!std::is_abstract_v<T>) create = [] { return static_cast<cls_Record*>(new T()); };
        AddEntry({T::Class, T::BaseRecord::TypeId(), create == nullptr, create,
                  []() -> const cls_FieldTable& { return T::Fields(); }});
    }
    /// Enters a class that is no record, such as a view on a store object; `baseId` 0 for none.
    void AddView(const cls_ClassInfo& info, unsigned baseId) {
        AddEntry({info, baseId, false, nullptr, nullptr});
    }

    /// Whether the first class is the second or derives from it. Unknown numbers derive from nothing.
    bool InheritanceCheck(const unsigned& derived, const unsigned& base) const;

    /// All classes, in the order in which they were entered.
    const std::vector<cls_ClassEntry>& All() const { return entries_; }
    const cls_ClassEntry* Find(unsigned id) const;
    const cls_ClassEntry* FindByName(std::string_view name) const;
    /// The classes that records of class `base` can be made of, in the order in which they were entered.
    std::vector<const cls_ClassEntry*> ConcreteClasses(unsigned base) const;
    /// The whole name; the number in hexadecimal for an unknown class.
    cow_String NameOf(unsigned id) const;
    /// The name that people read and write: without the prefix of its family, but whole where that word means
    /// the base of the class, which is another class.
    cow_String ShortNameOf(unsigned id) const;

private:
    void AddEntry(const cls_ClassEntry& entry);

    std::vector<cls_ClassEntry> entries_;
    std::unordered_map<unsigned, std::size_t> byId_;
};

/// The store's one registrar, filled with all classes of the store at its first use; reached through
/// omi_Singleton<cls_MetadataRegistrar>.
class cls_MetadataRegistrar {
public:
    cls_MetadataRegistrar();
    cls_ClassRegistrar& Registrar() { return registrar_; }

private:
    cls_ClassRegistrar registrar_;
};

inline cls_ClassRegistrar& cls_Classes() {
    return omi_Singleton<cls_MetadataRegistrar>::Instance().Registrar();
}

/// Raises unless the class `found` is or derives from `expected`; the text names both and the position.
void nex_CheckCast(unsigned found, unsigned expected, nex_Position position);

/// The object as a To; raises when it is none.
template <class To, class From>
const To& nex_canDynamicCastRef(const From& object, nex_Position position) {
    nex_CheckCast(object.DynTypeId(), To::TypeId(), position);
    return static_cast<const To&>(object);
}

/// The object as a To, or null when it is none.
template <class To, class From>
const To* nex_canDynamicCastPtr(const From* object) {
    if (object == nullptr || !cls_Classes().InheritanceCheck(object->DynTypeId(), To::TypeId()))
        return nullptr;
    return static_cast<const To*>(object);
}

#endif
