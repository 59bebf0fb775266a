#ifndef QRX_STORE_MDL_REPOSITORY_H
#define QRX_STORE_MDL_REPOSITORY_H

#include "foundation/cow_Range.h"
#include "store_interface/records/cls_FieldTable.h"
#include "store_interface/records/mdl_ReadNotes.h"

#include <map>

template <class T>
class mdl_RepositoryPlace;

/// Named records in ascending byte order of their names; copies share everything until one is written.
/// An absent name raises "<container>: no entry named '...'".
class mdl_Repository {
public:
    virtual ~mdl_Repository() = default;
    mdl_Repository(const mdl_Repository&) = default;
    mdl_Repository(mdl_Repository&&) = default;
    mdl_Repository& operator=(const mdl_Repository&) = default;
    mdl_Repository& operator=(mdl_Repository&&) = default;

    /// The class that all records derive from.
    unsigned ItemTypeId() const { return itemTypeId_; }
    const char* ContainerName() const { return name_; }
    cow_List<cow_String> Keys() const;
    bool IsMember(const cow_String& name) const { return FindRecord(name) != nullptr; }
    int Size() const { return Read().IsNull() ? 0 : static_cast<int>(records_.ConstGet().size()); }
    bool IsEmpty() const { return Size() == 0; }

    /// The record, or null.
    const cls_Record* FindRecord(const cow_String& name) const;
    const cls_Record& ConstGetRecord(const cow_String& name) const;
    /// The record for writing.
    cls_Record& WritableRecord(const cow_String& name);
    /// Stores a copy, in the place of an older record of the name.
    void InsertRecord(const cow_String& name, const cls_Record& record);
    bool Remove(const cow_String& name);
    void Clear() { records_ = {}; }
    /// The records in key order, for loops that leave the repository as it is.
    mdl_RepositoryPlace<cls_Record> begin() const;
    mdl_RepositoryPlace<cls_Record> end() const;
    /// Whether neither has been changed since one became a copy of the other.
    bool IsSharedWith(const mdl_Repository& other) const {
        return records_.Referent() == other.records_.Referent();
    }
    /// The holder under the name, or null.
    const mdl_ObjCow<cls_Record>* ConstHolder(const cow_String& name) const;
    /// The holder under the name for writing; an empty one at its first use.
    mdl_ObjCow<cls_Record>& Holder(const cow_String& name);

protected:
    mdl_Repository(const char* name, unsigned itemTypeId) : name_(name), itemTypeId_(itemTypeId) {}

    using Records = std::map<cow_String, mdl_ObjCow<cls_Record>>;
    using RecordsHolder = cow_COW<Records, cow_Direct<Records>>;
    friend class mdl_RepositoryIT;

    /// All reading goes through here.
    const RecordsHolder& Read() const {
        mdl_ReadNotes::Note(itemTypeId_);
        return records_;
    }
    Records::const_iterator Begin() const {
        return Read().IsNull() ? Records::const_iterator() : records_.ConstGet().begin();
    }
    Records::const_iterator End() const {
        return Read().IsNull() ? Records::const_iterator() : records_.ConstGet().end();
    }

    const char* name_;
    unsigned itemTypeId_;

private:
    RecordsHolder records_;
};

/// Walks a repository in key order. Keeps the repository's records as they are, also when it changes.
class mdl_RepositoryIT {
public:
    explicit mdl_RepositoryIT(const mdl_Repository& repository) : records_(repository.Read()) { First(); }
    void First() {
        if (!records_.IsNull()) place_ = records_.ConstGet().begin();
    }
    void Next() { ++place_; }
    bool IsDone() const { return records_.IsNull() || place_ == records_.ConstGet().end(); }
    const cow_String& CurrentKey() const { return place_->first; }
    const cls_Record& CurrentRecord() const { return place_->second.ConstGet(); }

private:
    mdl_Repository::RecordsHolder records_;
    mdl_Repository::Records::const_iterator place_;
};

/// Stands at an entry of a repository whose records are of class T or derive from it.
template <class T>
class mdl_RepositoryPlace {
public:
    using Place = std::map<cow_String, mdl_ObjCow<cls_Record>>::const_iterator;
    using iterator_category = std::input_iterator_tag;
    using difference_type = std::ptrdiff_t;
    using reference = cow_Entry<cow_String, const T&>;
    using value_type = reference;
    using pointer = void;

    mdl_RepositoryPlace() = default;
    explicit mdl_RepositoryPlace(Place place) : place_(place) {}
    reference operator*() const { return {place_->first, static_cast<const T&>(place_->second.ConstGet())}; }
    mdl_RepositoryPlace& operator++() {
        ++place_;
        return *this;
    }
    mdl_RepositoryPlace operator++(int) { return mdl_RepositoryPlace(place_++); }
    friend bool operator==(const mdl_RepositoryPlace& a, const mdl_RepositoryPlace& b) {
        return a.place_ == b.place_;
    }

private:
    Place place_;
};

inline mdl_RepositoryPlace<cls_Record> mdl_Repository::begin() const {
    return mdl_RepositoryPlace<cls_Record>(Begin());
}
inline mdl_RepositoryPlace<cls_Record> mdl_Repository::end() const {
    return mdl_RepositoryPlace<cls_Record>(End());
}

/// A repository of records of class T and the classes derived from it.
template <class T>
class mdl_MapString2ObjCow : public mdl_Repository {
public:
    using ItemRecord = T;
    mdl_MapString2ObjCow() : mdl_Repository(T::Class.name, T::TypeId()) {}
    const T& ConstGet(const cow_String& name) const { return static_cast<const T&>(ConstGetRecord(name)); }
    /// The record for writing.
    T& Get(const cow_String& name) { return static_cast<T&>(WritableRecord(name)); }
    void Insert(const cow_String& name, const T& record) { InsertRecord(name, record); }

    /// The entries in key order, for loops that leave the repository as it is.
    mdl_RepositoryPlace<T> begin() const { return mdl_RepositoryPlace<T>(Begin()); }
    mdl_RepositoryPlace<T> end() const { return mdl_RepositoryPlace<T>(End()); }
};

template <class T>
class mdl_MapString2ObjCowIT : public mdl_RepositoryIT {
public:
    explicit mdl_MapString2ObjCowIT(const mdl_MapString2ObjCow<T>& map) : mdl_RepositoryIT(map) {}
    const T& CurrentValue() const { return static_cast<const T&>(CurrentRecord()); }
};

/// The field type of every map of records.
class cls_RepositoryType : public cls_MapType {
public:
    explicit cls_RepositoryType(const cls_FieldType& item) : cls_MapType(item) {}
    bool Equal(const void* a, const void* b) const override;
    void Assign(void* to, const void* from) const override { At(to) = At(from); }
    cow_List<cow_String> Keys(const void* value) const override { return At(value).Keys(); }
    const void* Item(const void* value, const cow_String& key) const override;
    void Clear(void* value) const override;
    void* Insert(void* value, const cow_String& key) const override;

private:
    virtual mdl_Repository& At(void* value) const = 0;
    const mdl_Repository& At(const void* value) const { return At(const_cast<void*>(value)); }
};

/// The field type of the holders in a repository of records of the class.
class cls_RepositoryItemType : public cls_HolderType {
public:
    using cls_HolderType::cls_HolderType;
    bool Equal(const void* a, const void* b) const override { return cls_HeldEqual(Get(a), Get(b)); }
    void Assign(void* to, const void* from) const override { Set(to, Get(from)); }
    const cls_Record* Get(const void* value) const override;
    cls_Record* Writable(void* value) const override;
    void Set(void* value, const cls_Record* record) const override;
};

template <class T>
struct cls_TypeOf<mdl_MapString2ObjCow<T>> {
    class Type : public cls_RepositoryType {
    public:
        using cls_RepositoryType::cls_RepositoryType;

    private:
        mdl_Repository& At(void* value) const override {
            return *static_cast<mdl_MapString2ObjCow<T>*>(value);
        }
    };
    static const cls_FieldType& Instance() {
        static const cls_RepositoryItemType item(std::is_final_v<T> ? cls_FieldKind::Optional
                                                                    : cls_FieldKind::Variant,
                                                 [] { return T::TypeId(); });
        static const Type type(item);
        return type;
    }
};

#endif
