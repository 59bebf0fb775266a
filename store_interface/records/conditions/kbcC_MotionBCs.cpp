#include "store_interface/records/conditions/kbcC_MotionBCs.h"

#include "store_interface/records/cls_ClassRegistrar.h"

namespace {

constexpr const char* kFixed = "the components are held at their current values: no value is written";

constexpr cls_IntMeaning kBuckleCases[] = {
    {0, "both"}, {1, "pre-stress"}, {2, "buckling"}, {3, "both, as 0"}};

} // namespace

std::span<const cls_IntMeaning> kbcC_BuckleCaseMeanings() {
    return kBuckleCases;
}

bool kbcC_IsComplexProcedure(unsigned procedureId) {
    constexpr unsigned direct = 0x23C0076;
    constexpr unsigned subspace = 0x23C007E;
    return procedureId == direct || procedureId == subspace;
}

template <class T>
const cls_FieldTable& kbcC_DisplacementStateOf<T>::Fields() {
    constexpr auto zero = cls_BaseStateRule::ZeroValue;
    static const cls_FieldTable fields =
        cls_Describe<T>(kbcC_BCState::Fields())
            .template Field<&T::u1>("u1", "translation along axis 1")
            .Unit("length")
            .InBaseState(zero)
            .template Field<&T::u2>("u2", "translation along axis 2")
            .Unit("length")
            .InBaseState(zero)
            .template Field<&T::u3>("u3", "translation along axis 3")
            .Unit("length")
            .InBaseState(zero)
            .template Field<&T::ur1>("ur1", "rotation about axis 1")
            .Unit("radians")
            .InBaseState(zero)
            .template Field<&T::ur2>("ur2", "rotation about axis 2")
            .Unit("radians")
            .InBaseState(zero)
            .template Field<&T::ur3>("ur3", "rotation about axis 3")
            .Unit("radians")
            .InBaseState(zero)
            .template Field<&T::u1Imag>(
                "u1Imag",
                "imaginary part of u1, in harmonic steps of the direct kind; set and cleared with it")
            .Unit("length")
            .InBaseState(zero)
            .template Field<&T::u2Imag>(
                "u2Imag",
                "imaginary part of u2, in harmonic steps of the direct kind; set and cleared with it")
            .Unit("length")
            .InBaseState(zero)
            .template Field<&T::u3Imag>(
                "u3Imag",
                "imaginary part of u3, in harmonic steps of the direct kind; set and cleared with it")
            .Unit("length")
            .InBaseState(zero)
            .template Field<&T::ur1Imag>(
                "ur1Imag",
                "imaginary part of ur1, in harmonic steps of the direct kind; set and cleared with it")
            .Unit("radians")
            .InBaseState(zero)
            .template Field<&T::ur2Imag>(
                "ur2Imag",
                "imaginary part of ur2, in harmonic steps of the direct kind; set and cleared with it")
            .Unit("radians")
            .InBaseState(zero)
            .template Field<&T::ur3Imag>(
                "ur3Imag",
                "imaginary part of ur3, in harmonic steps of the direct kind; set and cleared with it")
            .Unit("radians")
            .InBaseState(zero)
            .template Field<&T::buckleCase>("buckleCase",
                                            "load cases of a buckling step that the condition enters")
            .Meanings(kBuckleCases)
            .Example(R"({"u1": 0, "u2": 0, "u3": -0.5})");
    return fields;
}

template class kbcC_DisplacementStateOf<kbcC_DisplacementBCState>;
template class kbcC_DisplacementStateOf<kbcC_ConnDisplacementBCState>;

template <class T>
const cls_FieldTable& kbcC_VelocityStateOf<T>::Fields() {
    constexpr auto zero = cls_BaseStateRule::ZeroValue;
    static const cls_FieldTable fields = cls_Describe<T>(kbcC_BCState::Fields())
                                             .template Field<&T::v1>("v1", "velocity along axis 1")
                                             .Unit("length/time")
                                             .InBaseState(zero)
                                             .template Field<&T::v2>("v2", "velocity along axis 2")
                                             .Unit("length/time")
                                             .InBaseState(zero)
                                             .template Field<&T::v3>("v3", "velocity along axis 3")
                                             .Unit("length/time")
                                             .InBaseState(zero)
                                             .template Field<&T::vr1>("vr1", "angular velocity about axis 1")
                                             .Unit("radians/time")
                                             .InBaseState(zero)
                                             .template Field<&T::vr2>("vr2", "angular velocity about axis 2")
                                             .Unit("radians/time")
                                             .InBaseState(zero)
                                             .template Field<&T::vr3>("vr3", "angular velocity about axis 3")
                                             .Unit("radians/time")
                                             .InBaseState(zero)
                                             .Example(R"({"v3": -1000})");
    return fields;
}

template class kbcC_VelocityStateOf<kbcC_VelocityBCState>;
template class kbcC_VelocityStateOf<kbcC_ConnVelocityBCState>;

template <class T>
const cls_FieldTable& kbcC_AccelerationStateOf<T>::Fields() {
    constexpr auto zero = cls_BaseStateRule::ZeroValue;
    static const cls_FieldTable fields =
        cls_Describe<T>(kbcC_BCState::Fields())
            .template Field<&T::a1>("a1", "acceleration along axis 1")
            .Unit("length/time^2")
            .InBaseState(zero)
            .template Field<&T::a2>("a2", "acceleration along axis 2")
            .Unit("length/time^2")
            .InBaseState(zero)
            .template Field<&T::a3>("a3", "acceleration along axis 3")
            .Unit("length/time^2")
            .InBaseState(zero)
            .template Field<&T::ar1>("ar1", "angular acceleration about axis 1")
            .Unit("radians/time^2")
            .InBaseState(zero)
            .template Field<&T::ar2>("ar2", "angular acceleration about axis 2")
            .Unit("radians/time^2")
            .InBaseState(zero)
            .template Field<&T::ar3>("ar3", "angular acceleration about axis 3")
            .Unit("radians/time^2")
            .InBaseState(zero)
            .Example(R"({"a3": -9810})");
    return fields;
}

template class kbcC_AccelerationStateOf<kbcC_AccelerationBCState>;
template class kbcC_AccelerationStateOf<kbcC_ConnAccelerationBCState>;

const cls_FieldTable& kbcC_ConnectorBC::Fields() {
    using R = kbcC_ConnectorBC;
    static const cls_FieldTable fields =
        cls_Describe<R>(kbcC_BC::Fields())
            .Field<&R::connectors>("connectors",
                                   "the connectors' sets: members of the element set of the condition's name")
            .RefersTo("set")
            .Field<&R::fixed>("fixed", kFixed)
            .Example(R"({"region": "CONNECTORS", "connectors": ["CONNECTORS"]})");
    return fields;
}

const cls_FieldTable& kbcC_DisplacementBC::Fields() {
    using R = kbcC_DisplacementBC;
    static const cls_FieldTable fields = cls_Describe<R>(kbcC_BC::Fields())
                                             .Field<&R::fixed>("fixed", kFixed)
                                             .Example(R"({"region": "PART-1.SET"})");
    return fields;
}

void cls_RegisterMotionConditionRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kbcC_DisplacementBC>();
    registrar.Add<kbcC_DisplacementBCState>();
    registrar.Add<kbcC_VelocityBC>();
    registrar.Add<kbcC_VelocityBCState>();
    registrar.Add<kbcC_AccelerationBC>();
    registrar.Add<kbcC_AccelerationBCState>();
    registrar.Add<kbcC_ConnectorBC>();
    registrar.Add<kbcC_ConnDisplacementBC>();
    registrar.Add<kbcC_ConnDisplacementBCState>();
    registrar.Add<kbcC_ConnVelocityBC>();
    registrar.Add<kbcC_ConnVelocityBCState>();
    registrar.Add<kbcC_ConnAccelerationBC>();
    registrar.Add<kbcC_ConnAccelerationBCState>();
}
