#ifndef QRX_OIF_OPSTATUS_H
#define QRX_OIF_OPSTATUS_H

#include "keyword_layer/qkw_ModelInfo.h"
#include "store_interface/records/conditions/kloC_BoltLoad.h"

#include <span>
#include <vector>

/// Where in a step an object stands, if it is written: in a load case with a factor, or, under the empty
/// name, in the step itself.
struct oif_ConditionPlace {
    cow_String loadCase;
    float scale = 1.0F;
};
using oif_ConditionPlaces = std::vector<oif_ConditionPlace>;

/// The objects for which a test holds, step by step in the order of their names. One walk over the objects
/// asks for all steps, so that a step costs nothing for what it only carries on.
template <class T>
class oif_ObjectsOfSteps {
public:
    struct Entry {
        const cow_String* name;
        const T* object;
    };

    oif_ObjectsOfSteps() = default;
    /// `kind` is what messages call the objects; `test(object, stepName)`.
    template <class Test>
    oif_ObjectsOfSteps(const char* kind, const kprC_PropagatingContainer<T>& objects,
                       const kprC_StepContainer& steps, const Test& test)
        : entries_(static_cast<std::size_t>(steps.Size())) {
        for (kprC_PropagatingContainerIT<T> it(objects); !it.IsDone(); it.Next()) {
            const Entry entry{&it.CurrentKey(), &it.CurrentValue()};
            for (int i = 0; i < steps.Size(); ++i) {
                const nex_Context stepContext("step", steps.NameAt(i));
                const nex_Context context(kind, *entry.name);
                if (test(*entry.object, steps.NameAt(i)))
                    entries_[static_cast<std::size_t>(i)].push_back(entry);
            }
        }
    }
    const std::vector<Entry>& In(int step) const { return entries_.at(static_cast<std::size_t>(step)); }

private:
    std::vector<std::vector<Entry>> entries_;
};

/// Which keyword families are written with ", op=NEW" in which steps. A keyword without it adds to what the
/// steps before said and changes it; one with it wipes out all earlier definitions of its family, so that
/// everything that goes on has to be said again. A builder configures its status once, before it makes any
/// keyword; no flag is ever taken back.
class oif_OpStatus {
public:
    virtual ~oif_OpStatus() = default;

    /// Whether the family of the class is written with ", op=NEW" in the step. A class without a family and
    /// an unknown step raise.
    bool OpNew(unsigned int typeId, const cow_String& stepName) const;
    /// Sets the flags of all families in the step; an index behind the last step is passed over.
    void ForceOpNew(int stepIndex);

protected:
    oif_OpStatus() = default;
    oif_OpStatus(const oif_OpStatus&) = default;
    oif_OpStatus& operator=(const oif_OpStatus&) = default;

    struct KeyRow {
        unsigned typeId;
        int key;
    };
    /// The family of the class; raises the text if no row has it.
    static int FindKey(std::span<const KeyRow> rows, unsigned typeId, const char* failure);

    void InitializeMembers(const cow_List<cow_String>& steps, int numberOfKeys);
    bool IsInitialStep(const cow_String& stepName) const {
        return !stepNames.IsEmpty() && stepNames[0] == stepName;
    }
    void SetFlag(int key, int stepIndex) { opNewFlags.Get(key).Put(stepIndex, 1); }
    /// Sets the flag of each object's family at the steps behind the initial one for which `test` holds;
    /// `kind` is what messages call them.
    template <class T, class Test>
    void SetFlagsWhere(const char* kind, const kprC_PropagatingContainer<T>& objects, const Test& test) {
        for (kprC_PropagatingContainerIT<T> it(objects); !it.IsDone(); it.Next()) {
            const T& object = it.CurrentValue();
            const nex_Context context(kind, it.CurrentKey());
            for (int i = 1; i < stepNames.Length(); ++i) {
                if (test(object, stepNames[i])) SetFlag(Key(object.DynTypeId()), i);
            }
        }
    }

    cow_List<cow_String> stepNames;
    cow_Map<int, cow_List<int>> opNewFlags;

private:
    /// The family of a class of objects.
    virtual int Key(unsigned int typeId) const = 0;

    kprC_StepIndex stepIndex_;
};

/// "*Boundary" and "*Connector Motion".
class oif_BCOpStatus final : public oif_OpStatus {
public:
    oif_BCOpStatus() = default;
    void Configure(const kprC_PropagatingContainer<kbcC_BC>& bcs,
                   const kprC_PropagatingContainer<kloC_Load>& loads, const cow_List<cow_String>& steps);
    /// Whether the condition is written in the step: in each load case that takes it, or without load cases
    /// in the step itself.
    bool Writes(const kbcC_BC& bc, const cow_String& stepName, bool inLoadCase) const;
    /// The load cases that take the condition, those of the base state taken without being named; in a step
    /// without load cases the step itself.
    static oif_ConditionPlaces Places(const kprC_Step& step, const cow_String& name,
                                      mdl_PropagationStatusEnm status);
    /// Status 9 or 10.
    static bool IsOfBaseState(mdl_PropagationStatusEnm status);
    /// Whether the bolt load stands among the boundary conditions of the step: while its length is given, and
    /// when that ends. `opMod` is false in a load case and where the family's flag is set.
    static bool WritesBolt(const kloC_BoltLoad& load, const cow_String& stepName, bool opMod);

private:
    void PopulateMembers(const kprC_PropagatingContainer<kbcC_BC>& bcs,
                         const kprC_PropagatingContainer<kloC_Load>& loads);
    int Key(unsigned int typeId) const override;
};

/// The families of load keywords.
class oif_LoadOpStatus final : public oif_OpStatus {
public:
    oif_LoadOpStatus() = default;
    void Configure(const kprC_PropagatingContainer<kloC_Load>& loads, const cow_List<cow_String>& steps,
                   const qkw_ModelInfo& modelInfo);
    /// Whether the load is written in the step; none is in the initial one.
    bool Writes(const kloC_Load& load, const cow_String& stepName) const;
    /// The load cases that take the load; the step itself if it has none, or none with loads of its own.
    static oif_ConditionPlaces Places(const kprC_Step& step, const cow_String& name);

private:
    void PopulateMembers(const kprC_PropagatingContainer<kloC_Load>& loads);
    /// Two loads of one family on one region can't be told apart by keywords that add and change.
    void ResolveOverlapRegions(const kprC_PropagatingContainer<kloC_Load>& loads,
                               const qkw_ModelInfo& modelInfo);
    int Key(unsigned int typeId) const override;
};

/// Predefined fields, each kind a family of its own.
class oif_FieldOpStatus final : public oif_OpStatus {
public:
    oif_FieldOpStatus() = default;
    void Configure(const kprC_PropagatingContainer<kpfC_Field>& fields, const cow_List<cow_String>& steps);
    /// Whether the field is written in the step.
    bool Writes(const kpfC_Field& field, const cow_String& stepName) const;
    /// The load cases that take the field; in a step without load cases the step itself.
    static oif_ConditionPlaces Places(const kprC_Step& step, const cow_String& name);

private:
    /// General fields are written again in each step that carries them.
    static bool WriteInEveryPropStep(const kpfC_Field& field);
    void PopulateMembers(const kprC_PropagatingContainer<kpfC_Field>& fields);
    int Key(unsigned int typeId) const override;
};

/// The interactions that op=NEW ends: films, radiation and general contact.
class oif_InteractionOpStatus final : public oif_OpStatus {
public:
    oif_InteractionOpStatus() = default;
    void Configure(const kprC_PropagatingContainer<kinC_Interaction>& interactions,
                   const cow_List<cow_String>& steps);

private:
    void PopulateMembers(const kprC_PropagatingContainer<kinC_Interaction>& interactions);
    int Key(unsigned int typeId) const override;
};

#endif
