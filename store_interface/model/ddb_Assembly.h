#ifndef QRX_STORE_DDB_ASSEMBLY_H
#define QRX_STORE_DDB_ASSEMBLY_H

#include "store_interface/model/ddb_Mesh.h"

#include <map>
#include <optional>

class ptoC_PartAttribute;
class ptoC_PartAttributeList;
struct odiK_Assembly;
struct odiK_Instance;
struct odiK_Part;
struct odiK_PartInstance;

/// View on a part.
class ddb_Part {
public:
    explicit ddb_Part(const cow_CountedHld<odiK_Part>& part) : part_(part) {}
    const cow_String& solverInput() const;

private:
    cow_CountedHld<odiK_Part> part_;
};

/// Walks parts or instances in ascending order of the bytes of their names.
template <class Entry, class View>
class ddb_ContainerIT {
public:
    using Entries = std::map<cow_String, cow_CountedHld<Entry>>;
    ddb_ContainerIT(const Entries& entries, const cow_CountedHld<odiK_Model>& model)
        : entries_(&entries), model_(model), place_(entries.begin()) {}
    void first() { place_ = entries_->begin(); }
    void next() { ++place_; }
    bool isDone() const { return place_ == entries_->end(); }
    const cow_String& currentKey() const { return place_->first; }
    // The same for range-based loops: names and views.
    cow_Entry<cow_String, View> operator*() const { return {currentKey(), currentValue()}; }
    ddb_ContainerIT& operator++() {
        next();
        return *this;
    }
    friend bool operator==(const ddb_ContainerIT& it, std::default_sentinel_t) { return it.isDone(); }

    View currentValue() const {
        if constexpr (std::is_constructible_v<View, const cow_CountedHld<Entry>&>) {
            return View(place_->second);
        } else {
            return View(place_->second, model_);
        }
    }

private:
    const Entries* entries_;
    cow_CountedHld<odiK_Model> model_;
    typename Entries::const_iterator place_;
};

class ddb_PartContainer {
public:
    explicit ddb_PartContainer(const cow_CountedHld<odiK_Model>& model) : model_(model) {}
    /// A name that is not there raises.
    ddb_Part get(const cow_String& name) const;
    int size() const;
    ddb_ContainerIT<odiK_Part, ddb_Part> createIterator() const;
    ddb_ContainerIT<odiK_Part, ddb_Part> begin() const { return createIterator(); }
    static std::default_sentinel_t end() { return {}; }

private:
    cow_CountedHld<odiK_Model> model_;
};

/// View on an entry of the assembly.
class ddb_BaseInstance {
public:
    static constexpr cls_ClassInfo Class{"ddb_BaseInstance", "an entry of the assembly"};
    static unsigned TypeId() { return Class.Id(); }

    ddb_BaseInstance(const cow_CountedHld<odiK_Instance>& instance, const cow_CountedHld<odiK_Model>& model)
        : instance_(instance), model_(model) {}
    unsigned DynTypeId() const;
    bool IsPartInstance() const;
    /// Six values: the translation, and the rotation vector, whose length is the angle in radians.
    cow_List<float> transform() const;

protected:
    cow_CountedHld<odiK_Instance> instance_;
    cow_CountedHld<odiK_Model> model_;
};

class ddb_MaterialOrientation;
class ddb_BeamOrientation;

int ddb_NumAttributes(const ptoC_PartAttributeList& list);
const ptoC_PartAttribute& ddb_AttributeAt(const ptoC_PartAttributeList& list, int index);

/// The orientations of one kind of an instance.
template <class View>
class ddb_OrientationContainer {
public:
    ddb_OrientationContainer(const cow_CountedHld<odiK_Instance>& instance,
                             const ptoC_PartAttributeList& list)
        : instance_(instance), list_(&list) {}
    int size() const { return ddb_NumAttributes(*list_); }
    /// An index outside the list raises.
    View get(int index) const { return View(ddb_AttributeAt(*list_, index)); }
    const ptoC_PartAttributeList& materialOrientations() const { return *list_; }
    const ptoC_PartAttributeList& beamOrientations() const { return *list_; }

private:
    cow_CountedHld<odiK_Instance> instance_;
    const ptoC_PartAttributeList* list_;
};

/// View on one orientation assignment.
class ddb_OrientationView {
public:
    explicit ddb_OrientationView(const ptoC_PartAttribute& record);
    /// The set that it is assigned to.
    ddb_Set region() const { return {region_.ConstSet().Id(), region_}; }

private:
    rgnC_Region region_;
};
class ddb_MaterialOrientation : public ddb_OrientationView {
public:
    using ddb_OrientationView::ddb_OrientationView;
};
class ddb_BeamOrientation : public ddb_OrientationView {
public:
    using ddb_OrientationView::ddb_OrientationView;
};
using ddb_MaterialOrientationContainer = ddb_OrientationContainer<ddb_MaterialOrientation>;
using ddb_BeamOrientationContainer = ddb_OrientationContainer<ddb_BeamOrientation>;

/// View on an instance of a part.
class ddb_PartInstance : public ddb_BaseInstance {
public:
    static constexpr cls_ClassInfo Class{"ddb_PartInstance", "an instance of a part"};
    static unsigned TypeId() { return Class.Id(); }

    /// Raises unless the entry is a part instance.
    explicit ddb_PartInstance(const ddb_BaseInstance& instance);

    const cow_String& name() const;
    const cow_String& partName() const;
    const cow_String& solverInput() const;
    ddb_Mesh mesh() const;
    ddb_NodeData nodeData() const { return mesh().nodeData(); }
    ddb_ElementData elementData() const { return mesh().elementData(); }
    /// The set of an id; an id outside the sets raises.
    ddb_Set set(int id) const { return mesh().set().get(id); }
    ddb_MaterialOrientationContainer materialOrientations() const;
    ddb_BeamOrientationContainer beamOrientations() const;
    /// Leads to the attribute lists of the instance; its name is the instance's.
    ddr_ShortcutTo<odiK_PartInstance> Shortcut() const;
};

class ddb_InstanceContainer {
public:
    explicit ddb_InstanceContainer(const cow_CountedHld<odiK_Model>& model) : model_(model) {}
    int size() const;
    ddb_ContainerIT<odiK_Instance, ddb_BaseInstance> createIterator() const;
    ddb_ContainerIT<odiK_Instance, ddb_BaseInstance> begin() const { return createIterator(); }
    static std::default_sentinel_t end() { return {}; }
    /// The part instance whose mesh has the index; none for any other index.
    std::optional<ddb_PartInstance> FindByMeshIndex(int meshIndex) const;

private:
    cow_CountedHld<odiK_Model> model_;
};
using ddb_InstanceContainerIT = ddb_ContainerIT<odiK_Instance, ddb_BaseInstance>;

/// View on the root assembly.
class ddb_Assembly {
public:
    explicit ddb_Assembly(const cow_CountedHld<odiK_Model>& model) : model_(model) {}
    const cow_String& name() const;
    const cow_String& solverInput() const;
    bool hasMesh() const;
    /// The assembly's own mesh, an empty one if it has none; mesh index 0.
    ddb_Mesh mesh() const;
    ddb_InstanceContainer instance() const { return ddb_InstanceContainer(model_); }
    ddb_SetList set() const { return {model_, cow_String()}; }
    /// The set of an id; an id outside the sets raises.
    ddb_Set set(int id) const { return set().get(id); }
    /// A node set by name; raises when there is none.
    ddb_Set nset(const cow_String& name) const;
    /// Leads to the assembly-level object.
    ddr_ShortcutTo<odiK_Assembly> Shortcut() const;

private:
    cow_CountedHld<odiK_Model> model_;
};

#endif
