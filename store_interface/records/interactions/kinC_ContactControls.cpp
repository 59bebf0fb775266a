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
            .Field<&R::absolutePenetrationTolerance>("absolutePenetrationTolerance", "allowed penetration")
            .Unit("length")
            .Field<&R::relativePenetrationTolerance>(
                "relativePenetrationTolerance", "allowed penetration as a fraction of the interface size")
            .Unit("no unit")
            .Field<&R::automaticTolerances>("automaticTolerances",
                                            "the solver sets the separation and overclosure tolerances")
            .Field<&R::delayedFrictionOnset>("delayedFrictionOnset", "when friction starts")
            .Meanings(delayedFrictionOnsetMeanings)
            .Field<&R::maxchp>("maxchp", "largest number of points that may violate contact in an increment")
            .Field<&R::perrmx>("perrmx", "largest tension allowed at such a point")
            .Unit("stress")
            .Field<&R::limitSlideDistance>("limitSlideDistance", "slideDistance is written")
            .Field<&R::slideDistance>("slideDistance", "largest sliding")
            .Unit("length")
            .Field<&R::stiffnessScaleFactor>("stiffnessScaleFactor", "factor on the penalty stiffness")
            .Unit("no unit")
            .Field<&R::uerrmx>("uerrmx", "largest overclosure allowed at such a point")
            .Unit("length")
            .Field<&R::stabilization>("stabilization", "viscous damping of rigid motion")
            .Meanings(stabilizationMeanings)
            .Field<&R::dampCoef>("dampCoef",
                                 "damping coefficient, where stabilization says that there is one")
            .Unit("stress*time/length")
            .Field<&R::eosFraction>("eosFraction", "fraction of damping left at the end of the step")
            .Unit("no unit")
            .Field<&R::tangFraction>("tangFraction", "tangential damping as a fraction of the normal one")
            .Unit("no unit")
            .Field<&R::zeroDampingClearance>("zeroDampingClearance", "clearance at which damping is zero")
            .Unit("length")
            .Field<&R::zeroDampingChoice>(
                "zeroDampingChoice",
                "whether the solver works out the clearance of zero damping or zeroDamping gives it")
            .Meanings(zeroDampingChoiceMeanings)
            .Field<&R::zeroDamping>(
                "zeroDamping",
                "clearance at which damping is zero, where zeroDampingChoice says that it is written")
            .Unit("length")
            .Example(R"({"stabilization": "automatic"})");
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
            .Field<&R::scalePenalty>("scalePenalty", "factor on the penalty stiffness")
            .Unit("no unit")
            .Field<&R::warpCheckPeriod>("warpCheckPeriod",
                                        "number of increments between checks for warped facets")
            .Field<&R::warpCutoff>("warpCutoff", "angle from which a facet counts as warped")
            .Unit("degrees")
            .Example(R"({"scalePenalty": 0.5})");
    return fields;
}

void cls_RegisterContactControlsRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kinC_StdContactControls>();
    registrar.Add<kinC_ExpContactControls>();
}
