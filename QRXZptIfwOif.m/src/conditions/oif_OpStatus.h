#ifndef QRX_OIF_OPSTATUS_H
#define QRX_OIF_OPSTATUS_H

#include "base/oif_Op.h"
#include "foundation/cow_List.h"
#include "keyword_layer/qkw_ModelInfo.h"
#include "store_interface/records/conditions/kloC_BoltLoad.h"

#include <vector>

/// Where in a step an object stands, if it is written: in a load case with a factor, or, under the empty
/// name, in the step itself.
struct oif_ConditionPlace {
    cow_String loadCase;
    float scale = 1.0F;

    bool IsLoadCase() const { return !loadCase.IsEmpty(); }
};
using oif_ConditionPlaces = std::vector<oif_ConditionPlace>;

/// The steps behind the initial one for which `test` holds, which must rest on the object's status and state
/// alone: what is the same in a run of steps is asked once. `size` is the number of steps.
template <class T, class Test>
std::vector<int> oif_StepsWhere(const T& object, int size, const Test& test) {
    std::vector<int> steps;
    const kprC_Timeline& timeline = object.Timeline();
    if (timeline.Size() != size) {
        // Steps that the object doesn't know are for `test` to find out.
        for (int i = 1; i < size; ++i) {
            if (test(i)) steps.push_back(i);
        }
        return steps;
    }
    for (const auto& [first, end, perturbation] : object.Runs()) {
        int step = first > 0 ? first : timeline.Next(perturbation, 1);
        if (step >= end || !test(step)) continue;
        for (; step < end; step = timeline.Next(perturbation, step + 1)) steps.push_back(step);
    }
    return steps;
}

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
    /// The flags of the family of the class, step by step. A class without a family raises.
    const cow_List<int>& Flags(unsigned int typeId) const {
        return opNewFlags[static_cast<std::size_t>(Key(typeId))];
    }
    /// Whether an object's keyword is, in the step or in a load case of it.
    template <class T>
    oif_Op Op(const T& object, const cow_String& stepName, bool /*inLoadCase*/ = false) const {
        return OpNew(object.DynTypeId(), stepName) ? oif_Op::NEW : oif_Op::MODIFY;
    }
    /// Sets the flags of all families in the step; an index behind the last step is passed over.
    void ForceOpNew(int stepIndex);

protected:
    oif_OpStatus() = default;
    oif_OpStatus(const oif_OpStatus&) = default;
    oif_OpStatus& operator=(const oif_OpStatus&) = default;

    void InitializeMembers(const cow_List<cow_String>& steps, int numberOfKeys);
    bool IsInitialStep(const cow_String& stepName) const {
        return !stepNames.IsEmpty() && stepNames[0] == stepName;
    }
    void SetFlag(int key, int stepIndex) { opNewFlags[static_cast<std::size_t>(key)].Put(stepIndex, 1); }
    /// Sets the flag of each object's family at the steps behind the initial one for which `test` holds;
    /// `kind` is what messages call them.
    template <class T, class Test>
    void SetFlagsWhere(const char* kind, const kprC_PropagatingContainer<T>& objects, const Test& test) {
        for (const auto& [name, object] : objects) {
            const nex_Context context(kind, name);
            for (const int step : oif_StepsWhere(object, stepNames.Length(), [&, &of = object](int i) {
                     return test(of, stepNames[i]);
                 })) {
                SetFlag(Key(object.DynTypeId()), step);
            }
        }
    }

    cow_List<cow_String> stepNames;
    /// By family, step by step.
    std::vector<cow_List<int>> opNewFlags;

private:
    /// The family of a class of objects.
    virtual int Key(unsigned int typeId) const = 0;

    kprC_StepIndex stepIndex_;
};

/// "*Boundary" and "*Connector Motion".
class oif_BCOpStatus final : public oif_OpStatus {
public:
    static constexpr const char* NoFamily = "Unimplemented bc->statusKey conversion";

    oif_BCOpStatus() = default;
    void Configure(const kprC_PropagatingContainer<kbcC_BC>& bcs,
                   const kprC_PropagatingContainer<kloC_Load>& loads, const cow_List<cow_String>& steps);
    /// In a load case each keyword begins anew.
    template <class T>
    oif_Op Op(const T& object, const cow_String& stepName, bool inLoadCase) const {
        return inLoadCase ? oif_Op::NEW : oif_OpStatus::Op(object, stepName);
    }
    /// Whether the condition is written in the step: in each load case that takes it, or without load cases
    /// in the step itself. A class without a family raises, whatever its status.
    bool Writes(const kbcC_BC& bc, const cow_String& stepName, bool inLoadCase) const;
    /// The load cases that take the condition, those of the base state taken without being named; in a step
    /// without load cases the step itself.
    static oif_ConditionPlaces Places(const kprC_Step& step, const cow_String& name,
                                      mdl_PropagationStatusEnm status);
    /// Status 9 or 10.
    static bool IsOfBaseState(mdl_PropagationStatusEnm status);
    /// Whether the bolt load stands among the boundary conditions of the step: while its length is given, and
    /// when that ends.
    bool WritesBolt(const kloC_BoltLoad& load, const cow_String& stepName, bool inLoadCase) const;
    /// The load cases that name the bolt load; in a step without load cases the step itself.
    static oif_ConditionPlaces PlacesOfBolt(const kprC_Step& step, const cow_String& name);

private:
    void PopulateMembers(const kprC_PropagatingContainer<kbcC_BC>& bcs,
                         const kprC_PropagatingContainer<kloC_Load>& loads);
    int Key(unsigned int typeId) const override;
};

/// The families of load keywords.
class oif_LoadOpStatus final : public oif_OpStatus {
public:
    static constexpr const char* NoFamily = "Unimplemented load->statusKey conversion";

    oif_LoadOpStatus() = default;
    void Configure(const kprC_PropagatingContainer<kloC_Load>& loads, const cow_List<cow_String>& steps,
                   const qkw_ModelInfo& modelInfo);
    /// Whether the load is written in the step; none is in the initial one.
    bool Writes(const kloC_Load& load, const cow_String& stepName, bool inLoadCase = false) const;
    /// The load cases that take the load; the step itself if it has none, or none with loads of its own.
    static oif_ConditionPlaces Places(const kprC_Step& step, const cow_String& name,
                                      mdl_PropagationStatusEnm status = {});

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
    static constexpr const char* NoFamily = "Unimplemented field->statusKey conversion";

    oif_FieldOpStatus() = default;
    void Configure(const kprC_PropagatingContainer<kpfC_Field>& fields, const cow_List<cow_String>& steps);
    /// Whether the field is written in the step.
    bool Writes(const kpfC_Field& field, const cow_String& stepName, bool inLoadCase = false) const;
    /// The load cases that take the field; in a step without load cases the step itself.
    static oif_ConditionPlaces Places(const kprC_Step& step, const cow_String& name,
                                      mdl_PropagationStatusEnm status = {});

private:
    /// General fields are written again in each step that carries them.
    static bool WriteInEveryPropStep(const kpfC_Field& field);
    void PopulateMembers(const kprC_PropagatingContainer<kpfC_Field>& fields);
    int Key(unsigned int typeId) const override;
};

/// The families of interactions, one a class: those that op=NEW ends.
enum class oif_InteractionFamily : int {
    FILM_CONDITION,
    RADIATION_TO_AMBIENT,
    GENERAL_CONTACT,
    CONCENTRATED_RADIATION
};

/// Null for a class without a family.
const oif_InteractionFamily* oif_FindInteractionFamily(unsigned typeId);

/// The interactions that op=NEW ends: films, radiation and general contact.
class oif_InteractionOpStatus final : public oif_OpStatus {
public:
    /// The text of an assertion, quotes and all, is the message.
    static constexpr const char* NoFamily = "\"Unimplemented interaction->statusKey conversion\" == 0";

    oif_InteractionOpStatus() = default;
    void Configure(const kprC_PropagatingContainer<kinC_Interaction>& interactions,
                   const cow_List<cow_String>& steps);
    /// The step itself: load cases take no interactions.
    static oif_ConditionPlaces Places(const kprC_Step& step, const cow_String& name,
                                      mdl_PropagationStatusEnm status);

private:
    void PopulateMembers(const kprC_PropagatingContainer<kinC_Interaction>& interactions);
    int Key(unsigned int typeId) const override;
};

#endif
