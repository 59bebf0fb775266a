#include "store_interface/records/conditions/kpfC_Fields.h"

#include "store_interface/records/cls_ClassRegistrar.h"

namespace {

template <class R>
void ResultsFile(cls_Describe<R>& describe) {
    describe
        .template Field<&R::beginStep>("beginStep",
                                       "first step to read from the results file; zero says none")
        .template Field<&R::beginIncrement>("beginIncrement", "increment of that step; zero says none")
        .template Field<&R::endStep>("endStep", "last step to read from the results file; zero says none")
        .template Field<&R::endIncrement>("endIncrement", "increment of that step; zero says none")
        .template Field<&R::interpolate>(
            "interpolate", "NONE: one mesh for both analyses; INTERPOLATE: two meshes; MIDSIDE: "
                           "midside nodes from the corner nodes");
}

} // namespace

const omu_EnumTable& omu_EnumTableOf(kpfC_InterpolateEnm) {
    static constexpr omu_EnumRow rows[] = {
        {0, "NONE", "NONE"}, {1, "INTERPOLATE", "INTERPOLATE"}, {2, "MIDSIDE", "MIDSIDE"}};
    static constexpr omu_EnumTable table{"kpfC_InterpolateEnm", rows};
    return table;
}

void kpfC_GeneralField::CompleteState(cls_Record& state, mdl_PropagationStatusEnm,
                                      const mdl_GivenState* given) const {
    if (given == nullptr || !given->IsGiven("values") || given->IsGiven("numberOfValues")) return;
    static_cast<kpfC_GeneralFieldState&>(state).numberOfValues = 0;
}

const cls_FieldTable& kpfC_TemperatureState::Fields() {
    using R = kpfC_TemperatureState;
    static const cls_FieldTable fields =
        cls_Describe<R>(kpfC_FieldState::Fields())
            .Field<&R::magnitude>("magnitude",
                                  "name of the results file, for the two distributions from a file")
            .With(ResultsFile<R>)
            .Field<&R::values>("values", "temperatures: one, or one for each section point")
            .Unit("temperature")
            .Field<&R::absoluteExteriorTolerance>("absoluteExteriorTolerance",
                                                  "how far a node may lie outside of the other mesh")
            .Unit("length")
            .Field<&R::exteriorTolerance>(
                "exteriorTolerance",
                "how far a node may lie outside, as a fraction of the average element size")
            .Unit("no unit")
            .Field<&R::amplitude>("amplitude", "amplitude in this step")
            .RefersTo("amplitude")
            .Example(R"({"values": [20]})");
    return fields;
}

const cls_FieldTable& kpfC_PressureStressState::Fields() {
    using R = kpfC_PressureStressState;
    static const cls_FieldTable fields =
        cls_Describe<R>(kpfC_FieldState::Fields())
            .Field<&R::magnitude>("magnitude", "equivalent pressure stress")
            .Unit("stress")
            .Field<&R::fileName>("fileName",
                                 "name of the results file, for the two distributions from a file")
            .Field<&R::amplitude>("amplitude", "amplitude in this step")
            .RefersTo("amplitude")
            .Example(R"({"magnitude": 5})");
    return fields;
}

const cls_FieldTable& kpfC_MassFlowRateState::Fields() {
    using R = kpfC_MassFlowRateState;
    static const cls_FieldTable fields =
        cls_Describe<R>(kpfC_FieldState::Fields())
            .Field<&R::component1>("component1", "mass flow rate along axis 1")
            .Unit("mass/(area*time)")
            .Field<&R::component2>("component2", "mass flow rate along axis 2")
            .Unit("mass/(area*time)")
            .Field<&R::component3>("component3", "mass flow rate along axis 3")
            .Unit("mass/(area*time)")
            .Field<&R::amplitude>("amplitude", "amplitude in this step")
            .RefersTo("amplitude")
            .Example(R"({"component1": 1e-9})");
    return fields;
}

const cls_FieldTable& kpfC_GeneralFieldState::Fields() {
    using R = kpfC_GeneralFieldState;
    static const cls_FieldTable fields =
        cls_Describe<R>(kpfC_FieldState::Fields())
            .Field<&R::variable>("variable", "number of the field variable, 1 and up")
            .Field<&R::numberOfValues>("numberOfValues",
                                       "number of values at a node; zero for as many as values has")
            .Field<&R::fileName>("fileName",
                                 "name of the results file, for the two distributions from a file")
            .With(ResultsFile<R>)
            .Field<&R::values>("values", "values: one, or one for each section point")
            .Unit("unit of the field variable")
            .Field<&R::amplitude>("amplitude", "amplitude in this step")
            .RefersTo("amplitude")
            .Example(R"({"variable": 1, "values": [0.5]})");
    return fields;
}

const cls_FieldTable& kpfC_Velocity::Fields() {
    using R = kpfC_Velocity;
    static const cls_FieldTable fields =
        cls_Describe<R>(kpfC_Field::Fields())
            .Field<&R::velocity1>("velocity1", "velocity along axis 1")
            .Unit("length/time")
            .Field<&R::velocity2>("velocity2", "velocity along axis 2")
            .Unit("length/time")
            .Field<&R::velocity3>("velocity3", "velocity along axis 3")
            .Unit("length/time")
            .Field<&R::omega>("omega", "angular velocity about the axis; zero for none")
            .Unit("radians/time")
            .Field<&R::axisBegin>("axisBegin", "first point of the axis of rotation: length")
            .Field<&R::axisEnd>("axisEnd", "second point of the axis of rotation: length")
            .Example(R"({"region": "PART-1.SET", "velocity3": -5000})");
    return fields;
}

const cls_FieldTable& kpfC_Stress::Fields() {
    using R = kpfC_Stress;
    static const cls_FieldTable fields =
        cls_Describe<R>(kpfC_Field::Fields())
            .Field<&R::sigma11>("sigma11",
                                "stress component 11; without it its place in the line stays empty")
            .Unit("stress")
            .Field<&R::sigma22>("sigma22",
                                "stress component 22; without it its place in the line stays empty")
            .Unit("stress")
            .Field<&R::sigma33>("sigma33",
                                "stress component 33; without it its place in the line stays empty")
            .Unit("stress")
            .Field<&R::sigma12>("sigma12",
                                "stress component 12; without it its place in the line stays empty")
            .Unit("stress")
            .Field<&R::sigma13>("sigma13",
                                "stress component 13; without it its place in the line stays empty")
            .Unit("stress")
            .Field<&R::sigma23>("sigma23",
                                "stress component 23; without it its place in the line stays empty")
            .Unit("stress")
            .Field<&R::stressMagnitude1>("stressMagnitude1",
                                         "GEOSTATIC: vertical stress at the first elevation")
            .Unit("stress")
            .Field<&R::vCoordinate1>("vCoordinate1", "GEOSTATIC: first elevation")
            .Unit("length")
            .Field<&R::stressMagnitude2>("stressMagnitude2",
                                         "GEOSTATIC: vertical stress at the second elevation")
            .Unit("stress")
            .Field<&R::vCoordinate2>("vCoordinate2", "GEOSTATIC: second elevation")
            .Unit("length")
            .Field<&R::lateralCoeff1>("lateralCoeff1", "GEOSTATIC: first coefficient of lateral stress")
            .Unit("no unit")
            .Field<&R::lateralCoeff2>(
                "lateralCoeff2", "GEOSTATIC: second coefficient of lateral stress, where it is not the first")
            .Unit("no unit")
            .Field<&R::fileName>("fileName",
                                 "name of the results file, for the two distributions from a file")
            .Field<&R::step>("step", "step of the results file; zero says none")
            .Field<&R::increment>("increment", "increment of that step; zero says none")
            .Example(R"({"region": "PART-1.SET", "sigma11": 100, "sigma22": 50})");
    return fields;
}

const cls_FieldTable& kpfC_Hardening::Fields() {
    using R = kpfC_Hardening;
    static const cls_FieldTable fields =
        cls_Describe<R>(kpfC_Field::Fields())
            .Field<&R::equivPlasticStrain>("equivPlasticStrain", "equivalent plastic strain")
            .Unit("no unit")
            .Field<&R::backstress>("backstress",
                                   "backstress components 11, 22, 33, 12, 13, 23, as many as there are")
            .Unit("stress")
            .Example(R"({"region": "PART-1.SET", "equivPlasticStrain": 0.02})");
    return fields;
}

void cls_RegisterFieldRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kpfC_TemperatureState>();
    registrar.Add<kpfC_Temperature>();
    registrar.Add<kpfC_PressureStressState>();
    registrar.Add<kpfC_PressureStress>();
    registrar.Add<kpfC_MassFlowRateState>();
    registrar.Add<kpfC_MassFlowRate>();
    registrar.Add<kpfC_GeneralFieldState>();
    registrar.Add<kpfC_GeneralField>();
    registrar.Add<kpfC_Velocity>();
    registrar.Add<kpfC_Stress>();
    registrar.Add<kpfC_Hardening>();
}
