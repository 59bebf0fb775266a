#include "store_interface/records/interactions/kinC_Contact.h"

#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/interactions/kinC_ContactControls.h"
#include "store_interface/records/interactions/kinC_ContactProperty.h"

namespace {

template <class State, class Controls>
cls_FieldTable WithControls() {
    return cls_Describe<State>(kinC_ContactPairState::Fields())
        .template InheritedRefersTo<Controls>("ContactControls")
        .Example(R"({"InteractionProperty": "Friction"})");
}

} // namespace

void kinC_ContactPair::CompleteState(cls_Record& state, mdl_PropagationStatusEnm status,
                                     const mdl_GivenState* given) const {
    if (given != nullptr && given->IsGiven("opDelete")) return;
    static_cast<kinC_ContactPairState&>(state).opDelete = status == mdl_PropagationStatusEnm::DEACTIVATED;
}

const omu_EnumTable& omu_EnumTableOf(kinC_ClearanceTypeEnm) {
    static constexpr omu_EnumRow rows[] = {
        {0, "NONE", "NONE"}, {1, "BOLT", "BOLT"}, {2, "SINGLE_VALUE", "SINGLE VALUE"}};
    static constexpr omu_EnumTable table{"kinC_ClearanceTypeEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kinC_StdAdjustEnm) {
    static constexpr omu_EnumRow rows[] = {
        {0, "NONE", "NONE"}, {1, "ZERO", "ZERO"}, {2, "TOLERANCE", "TOLERANCE"}, {3, "SET", "SET"}};
    static constexpr omu_EnumTable table{"kinC_StdAdjustEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kinC_InterferenceTypeEnm) {
    static constexpr omu_EnumRow rows[] = {
        {0, "NONE", "NONE"}, {1, "SHRINK_FIT", "SHRINK FIT"}, {2, "UNIFORM_FIT", "UNIFORM FIT"}};
    static constexpr omu_EnumTable table{"kinC_InterferenceTypeEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kinC_InterferenceDirectionTypeEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "COMPUTED", "COMPUTED"}, {1, "SPECIFIED", "SPECIFIED"}};
    static constexpr omu_EnumTable table{"kinC_InterferenceDirectionTypeEnm", rows};
    return table;
}

const cls_FieldTable& kinC_ContactPairState::Fields() {
    using R = kinC_ContactPairState;
    static const cls_FieldTable fields =
        cls_Describe<R>(kinC_InteractionState::Fields())
            .Field<&R::opDelete>("opDelete", "this state only removes the pair (explicit solver: op=DELETE)")
            .Field<&R::InteractionProperty>("InteractionProperty", "the contact property in force")
            .RefersTo<kinC_ContactProperty>("interactionProperty")
            .Field<&R::ContactControls>("ContactControls", "name of contact controls; empty: none")
            .RefersTo("contactControls")
            .Example(R"({"InteractionProperty": "Friction"})");
    return fields;
}

const cls_FieldTable& kinC_SurfaceToSurfaceContact::Fields() {
    using R = kinC_SurfaceToSurfaceContact;
    static constexpr cls_IntMeaning slidingMeanings[] = {{0, "small sliding"},
                                                         {1, "finite sliding (any value but 0)"}};
    static const cls_FieldTable fields =
        cls_Describe<R>(kinC_Interaction::Fields())
            .Field<&R::master>("master", "master surface")
            .Field<&R::slave>("slave", "slave surface; may be a node set")
            .Field<&R::sliding>("sliding", "tracking approach")
            .Meanings(slidingMeanings)
            .Field<&R::initialClearance>("initialClearance",
                                         "initial clearance; 2.2250738585072014e-308 means unset too")
            .Unit("length")
            .Field<&R::halfThreadAngle>("halfThreadAngle", "bolt clearance: half thread angle")
            .Unit("degrees")
            .Field<&R::pitch>("pitch", "bolt clearance: thread pitch")
            .Unit("length")
            .Field<&R::majorBoltDiameter>("majorBoltDiameter", "bolt clearance: major diameter of the thread")
            .Unit("length")
            .Field<&R::meanBoltDiameter>("meanBoltDiameter", "bolt clearance: mean diameter of the thread")
            .Unit("length")
            .Field<&R::clearanceRegion>(
                "clearanceRegion",
                "nodes to which the clearance applies; not set: the set name in the deck is empty")
            .Field<&R::clearanceType>("clearanceType",
                                      "kind of the initial clearance; the figures alone don't tell it");
    return fields;
}

const cls_FieldTable& kinC_SurfaceToSurfaceContactStdState::Fields() {
    using R = kinC_SurfaceToSurfaceContactStdState;
    static const cls_FieldTable fields =
        cls_Describe<R>(kinC_SurfaceToSurfaceContactState::Fields())
            .Field<&R::interferenceType>("interferenceType",
                                         "kind of interference fit, also one that was cleared or never set")
            .Field<&R::interferenceValue>("interferenceValue", "interference, of any kind but SHRINK_FIT")
            .Unit("length")
            .Field<&R::directionType>("directionType",
                                      "whether the solver works out the shift or direction gives it")
            .Field<&R::direction>("direction", "direction of the relative shift")
            .Unit("no unit")
            .Length(3)
            .Field<&R::amplitude>("amplitude", "amplitude of the interference, of UNIFORM_FIT; empty: none")
            .RefersTo("amplitude")
            .InheritedRefersTo<kinC_StdContactControls>("ContactControls")
            .Example(R"({"InteractionProperty": "Friction"})");
    return fields;
}

const cls_FieldTable& kinC_SurfaceToSurfaceContactStd::Fields() {
    using R = kinC_SurfaceToSurfaceContactStd;
    static constexpr cls_IntMeaning formulationMeanings[] = {{0, "node to surface (any value but 1)"},
                                                             {1, "surface to surface"}};
    static const cls_FieldTable fields =
        cls_Describe<R>(kinC_SurfaceToSurfaceContact::Fields())
            .Field<&R::adjust>("adjust",
                               "whether and how slave nodes are moved onto the master surface at the start")
            .Field<&R::adjustTolerance>("adjustTolerance", "adjustment zone, of adjust TOLERANCE")
            .Unit("length")
            .Field<&R::adjustRegion>("adjustRegion", "node set to adjust, of adjust SET")
            .Field<&R::formulation>("formulation", "contact discretization")
            .Meanings(formulationMeanings)
            .Field<&R::thickness>("thickness",
                                  "shell and membrane thickness counts; false writes 'no thickness'")
            .Field<&R::smooth>("smooth", "degree of smoothing of the master surface")
            .Unit("no unit")
            .Field<&R::tied>("tied", "the surfaces are tied for the whole analysis")
            .Field<&R::autoHcrit>("autoHcrit",
                                  "true: the solver chooses the overclosure limit; false writes 'hcrit='")
            .Field<&R::hcrit>("hcrit", "allowed penetration of a slave node, used when not autoHcrit")
            .Unit("length")
            .Field<&R::limitSlideDistance>("limitSlideDistance", "write 'slide distance=' for finite sliding")
            .Field<&R::slideDistance>("slideDistance", "largest expected sliding")
            .Unit("length")
            .Field<&R::extensionZone>(
                "extensionZone", "fraction of the end facet's size by which the master surface is extended")
            .Unit("no unit")
            .Field<&R::geometricCorrection>("geometricCorrection",
                                            "name of the geometric surface correction; empty: none")
            .Example(R"({"master": "PART-1.TOP", "slave": "PART-2.BOTTOM"})");
    return fields;
}

const cls_FieldTable& kinC_SurfaceToSurfaceContactXpl::Fields() {
    using R = kinC_SurfaceToSurfaceContactXpl;
    static constexpr cls_IntMeaning mechanicalConstraintMeanings[] = {{0, "KINEMATIC"}, {1, "PENALTY"}};
    static constexpr cls_IntMeaning weightingChoiceMeanings[] = {{0, "the solver (any value but 1)"},
                                                                 {1, "weight is written"}};
    static const cls_FieldTable fields =
        cls_Describe<R>(kinC_SurfaceToSurfaceContact::Fields())
            .Field<&R::mechanicalConstraint>("mechanicalConstraint", "how the contact constraint is enforced")
            .Meanings(mechanicalConstraintMeanings)
            .Field<&R::weightingChoice>("weightingChoice", "who sets the balance between the two surfaces")
            .Meanings(weightingChoiceMeanings)
            .Field<&R::weight>(
                "weight", "weighting factor between 0 and 1, where weightingChoice says that it is written")
            .Unit("no unit")
            .Example(R"({"master": "PART-1.TOP", "slave": "PART-2.BOTTOM"})");
    return fields;
}

const cls_FieldTable& kinC_SelfContact::Fields() {
    using R = kinC_SelfContact;
    static const cls_FieldTable fields = cls_Describe<R>(kinC_Interaction::Fields())
                                             .Field<&R::surface>("surface", "the surface; may be a node set");
    return fields;
}

const cls_FieldTable& kinC_SelfContactStd::Fields() {
    using R = kinC_SelfContactStd;
    static constexpr cls_IntMeaning formulationMeanings[] = {{0, "node to surface (any value but 1)"},
                                                             {1, "surface to surface"}};
    static const cls_FieldTable fields =
        cls_Describe<R>(kinC_SelfContact::Fields())
            .Field<&R::formulation>("formulation", "contact discretization")
            .Meanings(formulationMeanings)
            .Field<&R::thickness>("thickness", "shell and membrane thickness counts; false writes 'no "
                                               "thickness', of surface to surface only")
            .Field<&R::smooth>("smooth", "degree of smoothing of the surface")
            .Unit("no unit")
            .Example(R"({"surface": "PART-1.SKIN"})");
    return fields;
}

const cls_FieldTable& kinC_SelfContactXpl::Fields() {
    using R = kinC_SelfContactXpl;
    static constexpr cls_IntMeaning mechanicalConstraintMeanings[] = {{0, "KINEMATIC"}, {1, "PENALTY"}};
    static const cls_FieldTable fields =
        cls_Describe<R>(kinC_SelfContact::Fields())
            .Field<&R::mechanicalConstraint>("mechanicalConstraint", "how the contact constraint is enforced")
            .Meanings(mechanicalConstraintMeanings)
            .Example(R"({"surface": "PART-1.SKIN"})");
    return fields;
}

const cls_FieldTable& kinC_SurfaceToSurfaceContactXplState::Fields() {
    static const cls_FieldTable fields =
        WithControls<kinC_SurfaceToSurfaceContactXplState, kinC_ExpContactControls>();
    return fields;
}

const cls_FieldTable& kinC_SelfContactStdState::Fields() {
    static const cls_FieldTable fields = WithControls<kinC_SelfContactStdState, kinC_StdContactControls>();
    return fields;
}

const cls_FieldTable& kinC_SelfContactXplState::Fields() {
    static const cls_FieldTable fields = WithControls<kinC_SelfContactXplState, kinC_ExpContactControls>();
    return fields;
}

void cls_RegisterContactRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kinC_ContactPairState>();
    registrar.Add<kinC_ContactPair>();
    registrar.Add<kinC_SurfaceToSurfaceContactState>();
    registrar.Add<kinC_SurfaceToSurfaceContact>();
    registrar.Add<kinC_SurfaceToSurfaceContactStdState>();
    registrar.Add<kinC_SurfaceToSurfaceContactStd>();
    registrar.Add<kinC_SurfaceToSurfaceContactXplState>();
    registrar.Add<kinC_SurfaceToSurfaceContactXpl>();
    registrar.Add<kinC_SelfContactState>();
    registrar.Add<kinC_SelfContact>();
    registrar.Add<kinC_SelfContactStdState>();
    registrar.Add<kinC_SelfContactStd>();
    registrar.Add<kinC_SelfContactXplState>();
    registrar.Add<kinC_SelfContactXpl>();
}
