#include "store_interface/records/interactions/kinC_ContactControls.h"

#include "store_interface/records/cls_ClassRegistrar.h"

const cls_FieldTable& kinC_StdContactControls::Fields() {
    using R = kinC_StdContactControls;
    static constexpr cls_IntMeaning relativeToleranceMeanings[] = {
        {0, "absolutePenetrationTolerance (always written)"},
        {1, "relativePenetrationTolerance (any value but 0)"}};
    static constexpr cls_IntMeaning delayedFrictionOnsetMeanings[] = {
        {0, "at once"}, {1, "DELAYED: one increment after contact (any value but 0)"}};
    static constexpr cls_IntMeaning stabilizationMeanings[] = {
        {0, "off"}, {1, "with the coefficient dampCoef"}, {2, "automatic"}};
    static constexpr cls_IntMeaning zeroDampingChoiceMeanings[] = {{0, "computed"},
                                                                   {1, "zeroDamping is written"}};
    static const cls_FieldTable fields =
        cls_Describe<R>(kinC_ContactControls::Fields())
            .Field<&R::relativeTolerance>("relativeTolerance", "which penetration tolerance is in force")
            .Meanings(relativeToleranceMeanings)
            .Field<&R::absolutePenetrationTolerance>("absolutePenetrationTolerance",
                                                     "allowed penetration (length)")
            .Field<&R::relativePenetrationTolerance>(
                "relativePenetrationTolerance",
                "allowed penetration as a fraction of the interface size (no unit)")
            .Field<&R::automaticTolerances>("automaticTolerances",
                                            "the solver sets the separation and overclosure tolerances")
            .Field<&R::delayedFrictionOnset>("delayedFrictionOnset", "when friction starts")
            .Meanings(delayedFrictionOnsetMeanings)
            .Field<&R::maxchp>("maxchp", "largest number of points that may violate contact in an increment")
            .Field<&R::perrmx>("perrmx", "largest tension allowed at such a point (stress)")
            .Field<&R::limitSlideDistance>("limitSlideDistance", "slideDistance is written")
            .Field<&R::slideDistance>("slideDistance", "largest sliding (length)")
            .Field<&R::stiffnessScaleFactor>("stiffnessScaleFactor",
                                             "factor on the penalty stiffness (no unit)")
            .Field<&R::uerrmx>("uerrmx", "largest overclosure allowed at such a point (length)")
            .Field<&R::stabilization>("stabilization", "viscous damping of rigid motion")
            .Meanings(stabilizationMeanings)
            .Field<&R::dampCoef>("dampCoef", "damping coefficient, stabilization 1")
            .Field<&R::eosFraction>(
                "eosFraction",
                "fraction of damping left at the end of the step (no unit); first stabilization datum")
            .Field<&R::tangFraction>("tangFraction",
                                     "tangential damping as a fraction of the normal one (no unit)")
            .Field<&R::zeroDampingClearance>(
                "zeroDampingClearance",
                "clearance at which damping is zero (length); the stabilization datum behind eosFraction")
            .Field<&R::zeroDampingChoice>("zeroDampingChoice", "1 means that zeroDamping is written")
            .Meanings(zeroDampingChoiceMeanings)
            .Field<&R::zeroDamping>("zeroDamping", "last stabilization datum (length)");
    return fields;
}

const cls_FieldTable& kinC_ExpContactControls::Fields() {
    using R = kinC_ExpContactControls;
    static constexpr cls_IntMeaning globTrkChoiceMeanings[] = {
        {0, "the solver"}, {1, "globTrkInc is written (any value but 0)"}};
    static const cls_FieldTable fields =
        cls_Describe<R>(kinC_ContactControls::Fields())
            .Field<&R::globTrkChoice>("globTrkChoice", "who sets the interval of global searches")
            .Meanings(globTrkChoiceMeanings)
            .Field<&R::globTrkInc>("globTrkInc", "largest number of increments between global searches")
            .Field<&R::fastLocalTrk>("fastLocalTrk", "fast local tracking")
            .Field<&R::scalePenalty>("scalePenalty", "factor on the penalty stiffness (no unit)")
            .Field<&R::warpCheckPeriod>("warpCheckPeriod",
                                        "number of increments between checks for warped facets")
            .Field<&R::warpCutoff>("warpCutoff",
                                   "angle from which a facet counts as warped (angle, degrees)");
    return fields;
}

void cls_RegisterContactControlsRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kinC_StdContactControls>();
    registrar.Add<kinC_ExpContactControls>();
}
