#ifndef QRX_STORE_RGNC_REGION_H
#define QRX_STORE_RGNC_REGION_H

#include "foundation/cow_List.h"
#include "store_interface/records/cls_FieldTable.h"
#include "store_interface/regions/ddr_Shortcut.h"
#include "store_interface/regions/rgnC_SetData.h"

#include <initializer_list>

/// The set behind a region: its id among the sets of its owner, and its data.
class rgnC_Set {
public:
    rgnC_Set() = default;
    rgnC_Set(int id, const rgnC_SetData& data) : id_(id), data_(data) {}
    int Id() const { return id_; }
    const rgnC_SetData& Data() const { return data_; }

private:
    int id_ = -1;
    rgnC_SetData data_;
};

/// A reference of a record to a set of the assembly or of an instance; without a value by default.
class rgnC_Region {
public:
    rgnC_Region() = default;
    /// `instanceName` is empty for a set of the assembly.
    rgnC_Region(const ddr_Shortcut& shortcut, const cow_String& instanceName, const rgnC_Set& set)
        : shortcut_(shortcut), instanceName_(instanceName), set_(set) {}

    bool HasValue() const { return shortcut_.HasValue(); }
    const ddr_Shortcut& Shortcut() const { return shortcut_; }
    const rgnC_Set& ConstSet() const { return set_; }
    /// 0 without a value, 1 node set, 2 element set, 8 surface.
    int FlagWord() const;
    const cow_String& InstanceName() const { return instanceName_; }
    const cow_String& SetName() const { return shortcut_.Name(); }

    /// The same set of the same owner.
    friend bool operator==(const rgnC_Region& a, const rgnC_Region& b) { return a.shortcut_ == b.shortcut_; }

private:
    ddr_Shortcut shortcut_;
    cow_String instanceName_;
    rgnC_Set set_;
};

/// Those of the regions that are node sets, in order: what keywords name as surfaces needs a node-based
/// surface for these.
cow_List<rgnC_Region> rgnC_NodeSetsAmong(std::initializer_list<rgnC_Region> regions);

template <>
struct cls_TypeOf<rgnC_Region> : cls_PlainTypeOf<rgnC_Region, cls_FieldKind::Region> {};

/// A reference to a datum of the model by its id; id 0 is the null reference. Only ids are compared.
class dtmC_DatumRef {
public:
    dtmC_DatumRef() = default;
    explicit dtmC_DatumRef(int datumId, int index = 0, const cow_String& path = {})
        : id_(datumId), index_(index), path_(path) {}
    bool IsNullRef() const { return id_ == 0; }
    int Id() const { return id_; }
    int Index() const { return index_; }
    const cow_String& Path() const { return path_; }
    friend bool operator==(const dtmC_DatumRef& a, const dtmC_DatumRef& b) { return a.id_ == b.id_; }

private:
    int id_ = 0;
    int index_ = 0;
    cow_String path_;
};

template <>
struct cls_TypeOf<dtmC_DatumRef> : cls_PlainTypeOf<dtmC_DatumRef, cls_FieldKind::Datum> {};

#endif
