#ifndef QRX_STORE_KINC_INTERACTION_H
#define QRX_STORE_KINC_INTERACTION_H

#include "store_interface/propagation/kprC_PropagatingObject.h"
#include "store_interface/regions/rgnC_Region.h"

/// State of an interaction in one step; has no data of its own and serves the classes that need none.
class kinC_InteractionState : public cls_RecordOf<kinC_InteractionState> {
public:
    static constexpr cls_ClassInfo Class{"kinC_InteractionState", "state of an interaction in one step",
                                         0x2A00011};
};

/// Contact and other interactions, held by name.
class kinC_Interaction : public kprC_PropagatingOf<kinC_Interaction, kinC_InteractionState> {
public:
    static constexpr cls_ClassInfo Class{"kinC_Interaction", "contact or another interaction", 0x2A00010};

    mdl_PropagationFamilyEnm Family() const override { return mdl_PropagationFamilyEnm::INTERACTION; }
    /// The status in the step; 0 for a step that is not there.
    mdl_PropagationStatusEnm GetPropStatus(const cow_String& stepName) const {
        return KnowsStep(stepName) ? Status(stepName) : mdl_PropagationStatusEnm::NOT_YET_ACTIVE;
    }
    /// The state in the step; a default one for a step that is not there, such as the creating step of an
    /// interaction that no step creates.
    const kinC_InteractionState& ConstGetState(const cow_String& stepName) const {
        return KnowsStep(stepName) ? ConstGetStateQuad(stepName).state.ConstGet() : DefaultState();
    }
    /// Whether it is in force in the step: status 1, 2, 3, 8, 9 or 10.
    bool HasStep(const cow_String& stepName) const;
    /// Status 1, 3 or 4: created, changed or ended in the step.
    bool IsModified(const cow_String& stepName) const;
    /// Puts a copy of the state in the place of the step's own; statuses stay as they are. A state of another
    /// class than the step's raises.
    void Insert(const cow_String& stepName, const kinC_InteractionState& state);
    /// The node sets that it names as surfaces of contact; none for a suppressed one.
    cow_List<rgnC_Region> ConstGetContactNodeSets() const;

protected:
    /// A state as new, of the state class.
    virtual const kinC_InteractionState& DefaultState() const;
    /// The surfaces that its contact keywords name, in declared order.
    virtual cow_List<rgnC_Region> ContactSurfaces() const { return {}; }
};

/// Base of the interaction class T, itself derived from Base, with states of class State.
template <class T, class State, class Base = kinC_Interaction>
class kinC_InteractionOf : public cls_RecordOf<T, Base> {
public:
    const State& ConstGetState(const cow_String& stepName) const {
        return static_cast<const State&>(kinC_Interaction::ConstGetState(stepName));
    }
    cls_Record* NewState(unsigned) const override { return new State(); }

protected:
    const kinC_InteractionState& DefaultState() const override {
        static const State state;
        return state;
    }
};

/// Properties that interactions refer to by name.
class kinC_InteractionProperty : public cls_AbstractRecordOf<kinC_InteractionProperty> {
public:
    static constexpr cls_ClassInfo Class{"kinC_InteractionProperty", "a property of interactions", 0x2A00040};
};

/// Numerical options of contact that interactions refer to by name.
class kinC_ContactControls : public cls_AbstractRecordOf<kinC_ContactControls> {
public:
    static constexpr cls_ClassInfo Class{"kinC_ContactControls", "numerical options of contact", 0x2A00050};

    /// Whether every field is that of a new record of the class.
    bool IsDefault() const;
    /// An independent copy on the heap.
    kinC_ContactControls* DeepCopy() const { return static_cast<kinC_ContactControls*>(Copy()); }
};

class kinC_ContactInitialization final : public cls_RecordOf<kinC_ContactInitialization> {
public:
    static constexpr cls_ClassInfo Class{"kinC_ContactInitialization", "a named initialization of contact",
                                         0x2A00058};
};

class kinC_ContactStabilization final : public cls_RecordOf<kinC_ContactStabilization> {
public:
    static constexpr cls_ClassInfo Class{"kinC_ContactStabilization", "a named stabilization of contact",
                                         0x2A00059};
};

void cls_RegisterInteractionRecords(cls_ClassRegistrar& registrar);

#endif
