#include "store_interface/records/conditions/kbcC_ScalarBCs.h"

#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/conditions/kbcC_MotionBCs.h"

bool kbcC_TemperatureBC::ModifiedNeedsOpNew(const cow_String& stepName) const {
    const auto& state =
        static_cast<const kbcC_TemperatureBCState&>(ConstGetStateQuad(stepName).state.ConstGet());
    return FreesComponent(stepName) || (dofsGiven && state.dofs.IsModified());
}

bool kbcC_ComplexDistributedBCState::UseComplex(unsigned int procedureId) const {
    return kbcC_IsComplexProcedure(procedureId);
}

const cls_FieldTable& kbcC_TemperatureBCState::Fields() {
    using R = kbcC_TemperatureBCState;
    static const cls_FieldTable fields =
        cls_Describe<R>(kbcC_BCState::Fields())
            .Field<&R::magnitude>("magnitude", "the temperature")
            .Unit("temperature")
            .InBaseState(cls_BaseStateRule::ZeroValue)
            .Field<&R::dofs>(
                "dofs", "degrees of freedom 11, 12, ... in the order of the data lines; read if dofsGiven")
            .Example(R"({"magnitude": 80})");
    return fields;
}

const cls_FieldTable& kbcC_TemperatureBC::Fields() {
    using R = kbcC_TemperatureBC;
    static const cls_FieldTable fields =
        cls_Describe<R>(kbcC_BC::Fields())
            .Field<&R::dofsGiven>("dofsGiven", "the states list the degrees of freedom; otherwise it is 11")
            .Example(R"({"region": "PART-1.SET"})");
    return fields;
}

const cls_FieldTable& kbcC_DistributedBCState::Fields() {
    using R = kbcC_DistributedBCState;
    static const cls_FieldTable fields = cls_Describe<R>(kbcC_BCState::Fields())
                                             .Field<&R::magnitude>("magnitude", "the value")
                                             .Unit("unit of the quantity")
                                             .InBaseState(cls_BaseStateRule::ZeroValue)
                                             .Example(R"({"magnitude": 0.1})");
    return fields;
}

const cls_FieldTable& kbcC_ComplexDistributedBCState::Fields() {
    using R = kbcC_ComplexDistributedBCState;
    static const cls_FieldTable fields =
        cls_Describe<R>(kbcC_DistributedBCState::Fields())
            .Field<&R::imaginaryMagnitude>(
                "imaginaryMagnitude",
                "imaginary part of magnitude, in harmonic steps of the direct kind; set and cleared with it")
            .Unit("unit of the quantity")
            .InBaseState(cls_BaseStateRule::ZeroValue)
            .Example(R"({"magnitude": 0.1, "imaginaryMagnitude": 0.02})");
    return fields;
}

const cls_FieldTable& kbcC_DistributedBC::Fields() {
    using R = kbcC_DistributedBC;
    static const cls_FieldTable fields =
        cls_Describe<R>(kbcC_BC::Fields())
            .Field<&R::fixed>("fixed", "the flag of that name is written, and the value all the same")
            .Example(R"({"region": "PART-1.SET"})");
    return fields;
}

void cls_RegisterScalarConditionRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kbcC_TemperatureBC>();
    registrar.Add<kbcC_TemperatureBCState>();
    registrar.Add<kbcC_DistributedBC>();
    registrar.Add<kbcC_DistributedBCState>();
    registrar.Add<kbcC_ComplexDistributedBCState>();
    registrar.Add<kbcC_PorePressureBC>();
    registrar.Add<kbcC_AcousticPressureBC>();
    registrar.Add<kbcC_FluidPressureBC>();
    registrar.Add<kbcC_ElectricPotentialBC>();
    registrar.Add<kbcC_ConcentrationBC>();
    registrar.Add<kbcC_FluidCavityPressureBC>();
}
