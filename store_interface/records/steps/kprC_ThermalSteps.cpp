#include "store_interface/records/steps/kprC_ThermalSteps.h"

#include "store_interface/records/cls_ClassRegistrar.h"

const omu_EnumTable& omu_EnumTableOf(kprC_CoupledTempDisplacementStep::CreepEnm) {
    static constexpr omu_EnumRow rows[] = {
        {0, "AUTOMATIC", "AUTOMATIC"}, {1, "EXPLICIT", "EXPLICIT"}, {2, "NONE", "NONE"}};
    static constexpr omu_EnumTable table{"kprC_CoupledTempDisplacementStep::CreepEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kprC_CoupledTempDisplacementStep::StabilizationMethodEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "NONE", "NONE"},
                                           {1, "DISSIPATED_ENERGY_FRACTION", "DISSIPATED_ENERGY_FRACTION"},
                                           {2, "DAMPING_FACTOR", "DAMPING_FACTOR"}};
    static constexpr omu_EnumTable table{"kprC_CoupledTempDisplacementStep::StabilizationMethodEnm", rows};
    return table;
}

const cls_FieldTable& kprC_CoupledTempDisplacementStep::Fields() {
    using R = kprC_CoupledTempDisplacementStep;
    static const cls_FieldTable fields =
        cls_Describe<R>(kprC_AnalysisStep::Fields())
            .Field<&R::nlgeom>("nlgeom", "large-displacement effects: 1 (any non-zero) on, 0 off")
            .Field<&R::response>("response", "0 steady state, otherwise transient")
            .Field<&R::timePeriod>("timePeriod", "time period of the step (time)")
            .Field<&R::stabilizationMethod>(
                "stabilizationMethod",
                "0 none, 1 by dissipated energy fraction, 2 by damping factor; other values write nothing")
            .Field<&R::stabilizationMagnitude>(
                "stabilizationMagnitude",
                "dissipated energy fraction (no unit) or damping factor, by the method")
            .Field<&R::timeIncrementationMethod>("timeIncrementationMethod",
                                                 "0 automatic, 1 direct (fixed increments)")
            .Field<&R::maxNumInc>("maxNumInc", "largest number of increments; 100 is not written")
            .Field<&R::initialInc>("initialInc", "first (or fixed) time increment (time)")
            .Field<&R::minInc>("minInc", "smallest time increment (time), automatic method only")
            .Field<&R::maxInc>("maxInc", "largest time increment (time), automatic method only")
            .Field<&R::deltmx>("deltmx",
                               "largest temperature change per increment (temperature), written above 0")
            .Field<&R::cetol>("cetol", "largest creep strain error per increment (no unit), written above 0")
            .Field<&R::creep>("creep", "0 automatic, 1 explicit, 2 none")
            .Field<&R::amplitude>("amplitude",
                                  "course of loads without an amplitude: 0 step, 1 ramp; 0 is not written")
            .Field<&R::extrapolation>("extrapolation",
                                      "0 is not written; else 1 prints PARABOLIC, any other value NO")
            .Field<&R::solutionTechnique>("solutionTechnique", "0 full Newton, 1 separated, 2 quasi-Newton");
    return fields;
}

const cls_FieldTable& kprC_CoupledThermalElectricStep::Fields() {
    using R = kprC_CoupledThermalElectricStep;
    static const cls_FieldTable fields =
        cls_Describe<R>(kprC_AnalysisStep::Fields())
            .Field<&R::response>("response", "0 steady state, otherwise transient")
            .Field<&R::end>("end", "rate of change that ends a transient step when it is reached; unset = "
                                   "the step ends with its period")
            .Field<&R::timePeriod>("timePeriod", "time period of the step (time)")
            .Field<&R::timeIncrementationMethod>("timeIncrementationMethod",
                                                 "0 automatic, 1 direct (fixed increments)")
            .Field<&R::maxNumInc>("maxNumInc", "largest number of increments; 100 is not written")
            .Field<&R::initialInc>("initialInc", "first (or fixed) time increment (time)")
            .Field<&R::minInc>("minInc", "smallest time increment (time), automatic method only")
            .Field<&R::maxInc>("maxInc", "largest time increment (time), automatic method only")
            .Field<&R::deltmx>("deltmx", "largest temperature change per increment (temperature)")
            .Field<&R::mxdem>("mxdem",
                              "largest emissivity change per increment (no unit); 0.1 is not written")
            .Field<&R::amplitude>("amplitude",
                                  "course of loads without an amplitude: 0 step, 1 ramp; 0 is not written")
            .Field<&R::extrapolation>("extrapolation",
                                      "0 is not written; else 1 prints PARABOLIC, any other value NO")
            .Field<&R::solutionTechnique>("solutionTechnique", "0 full Newton, 1 separated, 2 quasi-Newton");
    return fields;
}

const cls_FieldTable& kprC_HeatTransferStep::Fields() {
    using R = kprC_HeatTransferStep;
    static const cls_FieldTable fields =
        cls_Describe<R>(kprC_AnalysisStep::Fields())
            .Field<&R::response>("response", "0 steady state, otherwise transient")
            .Field<&R::end>("end", "rate of change that ends a transient step when it is reached; unset = "
                                   "the step ends with its period")
            .Field<&R::timePeriod>("timePeriod", "time period of the step (time)")
            .Field<&R::timeIncrementationMethod>("timeIncrementationMethod",
                                                 "0 automatic, 1 direct (fixed increments)")
            .Field<&R::maxNumInc>("maxNumInc", "largest number of increments; 100 is not written")
            .Field<&R::initialInc>("initialInc", "first (or fixed) time increment (time)")
            .Field<&R::minInc>("minInc", "smallest time increment (time), automatic method only")
            .Field<&R::maxInc>("maxInc", "largest time increment (time), automatic method only")
            .Field<&R::deltmx>("deltmx", "largest temperature change per increment (temperature)")
            .Field<&R::mxdem>("mxdem",
                              "largest emissivity change per increment (no unit); 0.1 is not written")
            .Field<&R::amplitude>("amplitude",
                                  "course of loads without an amplitude: 0 step, 1 ramp; 0 is not written")
            .Field<&R::extrapolation>("extrapolation",
                                      "0 is not written; else 1 prints PARABOLIC, any other value NO");
    return fields;
}

const cls_FieldTable& kprC_MassDiffusionStep::Fields() {
    using R = kprC_MassDiffusionStep;
    static const cls_FieldTable fields =
        cls_Describe<R>(kprC_AnalysisStep::Fields())
            .Field<&R::response>("response", "0 steady state, otherwise transient")
            .Field<&R::end>("end", "rate of change that ends a transient step when it is reached; 0 = the "
                                   "step ends with its period")
            .Field<&R::timePeriod>("timePeriod", "time period of the step (time)")
            .Field<&R::timeIncrementationMethod>("timeIncrementationMethod",
                                                 "0 automatic, 1 direct (fixed increments)")
            .Field<&R::maxNumInc>("maxNumInc", "largest number of increments; 100 is not written")
            .Field<&R::initialInc>("initialInc", "first (or fixed) time increment (time)")
            .Field<&R::minInc>("minInc", "smallest time increment (time), automatic method only")
            .Field<&R::maxInc>("maxInc", "largest time increment (time), automatic method only")
            .Field<&R::dcmax>("dcmax", "largest normalised concentration change per increment")
            .Field<&R::amplitude>("amplitude",
                                  "course of loads without an amplitude: 0 step, 1 ramp; 0 is not written")
            .Field<&R::extrapolation>("extrapolation",
                                      "0 is not written; else 1 prints PARABOLIC, any other value NO");
    return fields;
}

void cls_RegisterThermalStepRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kprC_CoupledTempDisplacementStep>();
    registrar.Add<kprC_CoupledThermalElectricStep>();
    registrar.Add<kprC_HeatTransferStep>();
    registrar.Add<kprC_MassDiffusionStep>();
}
