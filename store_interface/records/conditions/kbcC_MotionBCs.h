#ifndef QRX_STORE_KBCC_MOTIONBCS_H
#define QRX_STORE_KBCC_MOTIONBCS_H

#include "store_interface/records/conditions/kbcC_BC.h"

class cls_ClassRegistrar;

/// Whether a step of the procedure is a harmonic one that takes prescribed values with two parts. Modal
/// procedures use the supports of the modes.
bool kbcC_IsComplexProcedure(unsigned procedureId);
/// What the numbers of a field buckleCase mean.
std::span<const cls_IntMeaning> kbcC_BuckleCaseMeanings();

/// What the states of displacement conditions on nodes and on connectors share.
template <class T>
class kbcC_DisplacementStateOf : public cls_RecordOf<T, kbcC_BCState> {
public:
    mdl_PropAttr<double> u1;
    mdl_PropAttr<double> u2;
    mdl_PropAttr<double> u3;
    mdl_PropAttr<double> ur1;
    mdl_PropAttr<double> ur2;
    mdl_PropAttr<double> ur3;
    double u1Imag = 0.0;
    double u2Imag = 0.0;
    double u3Imag = 0.0;
    double ur1Imag = 0.0;
    double ur2Imag = 0.0;
    double ur3Imag = 0.0;
    int buckleCase = 0;

    bool UseComplex(unsigned int procedureId) const override { return kbcC_IsComplexProcedure(procedureId); }
    kbcC_Component Component(int index) const override {
        using S = kbcC_DisplacementStateOf;
        static constexpr mdl_PropAttr<double> S::*values[] = {&S::u1,  &S::u2,  &S::u3,
                                                              &S::ur1, &S::ur2, &S::ur3};
        static constexpr double S::*imaginary[] = {&S::u1Imag,  &S::u2Imag,  &S::u3Imag,
                                                   &S::ur1Imag, &S::ur2Imag, &S::ur3Imag};
        return {this->*values[index], this->*imaginary[index]};
    }
    int BuckleCase() const override { return buckleCase; }

    static const cls_FieldTable& Fields();
};

class kbcC_DisplacementBCState final : public kbcC_DisplacementStateOf<kbcC_DisplacementBCState> {
public:
    static constexpr cls_ClassInfo Class{"kbcC_DisplacementBCState",
                                         "displacements and rotations of nodes in one step"};
};

class kbcC_ConnDisplacementBCState final : public kbcC_DisplacementStateOf<kbcC_ConnDisplacementBCState> {
public:
    static constexpr cls_ClassInfo Class{"kbcC_ConnDisplacementBCState",
                                         "displacements and rotations of connectors in one step"};
};

/// What the states of velocity conditions on nodes and on connectors share.
template <class T>
class kbcC_VelocityStateOf : public cls_RecordOf<T, kbcC_BCState> {
public:
    mdl_PropAttr<double> v1;
    mdl_PropAttr<double> v2;
    mdl_PropAttr<double> v3;
    mdl_PropAttr<double> vr1;
    mdl_PropAttr<double> vr2;
    mdl_PropAttr<double> vr3;

    bool UseComplex(unsigned int procedureId) const override { return kbcC_IsComplexProcedure(procedureId); }
    kbcC_Component Component(int index) const override {
        using S = kbcC_VelocityStateOf;
        static constexpr mdl_PropAttr<double> S::*values[] = {&S::v1,  &S::v2,  &S::v3,
                                                              &S::vr1, &S::vr2, &S::vr3};
        return {this->*values[index], 0.0};
    }

    static const cls_FieldTable& Fields();
};

class kbcC_VelocityBCState final : public kbcC_VelocityStateOf<kbcC_VelocityBCState> {
public:
    static constexpr cls_ClassInfo Class{"kbcC_VelocityBCState",
                                         "velocities and angular velocities of nodes in one step"};
};

class kbcC_ConnVelocityBCState final : public kbcC_VelocityStateOf<kbcC_ConnVelocityBCState> {
public:
    static constexpr cls_ClassInfo Class{"kbcC_ConnVelocityBCState",
                                         "velocities and angular velocities of connectors in one step"};
};

/// What the states of acceleration conditions on nodes and on connectors share.
template <class T>
class kbcC_AccelerationStateOf : public cls_RecordOf<T, kbcC_BCState> {
public:
    mdl_PropAttr<double> a1;
    mdl_PropAttr<double> a2;
    mdl_PropAttr<double> a3;
    mdl_PropAttr<double> ar1;
    mdl_PropAttr<double> ar2;
    mdl_PropAttr<double> ar3;

    bool UseComplex(unsigned int procedureId) const override { return kbcC_IsComplexProcedure(procedureId); }
    kbcC_Component Component(int index) const override {
        using S = kbcC_AccelerationStateOf;
        static constexpr mdl_PropAttr<double> S::*values[] = {&S::a1,  &S::a2,  &S::a3,
                                                              &S::ar1, &S::ar2, &S::ar3};
        return {this->*values[index], 0.0};
    }

    static const cls_FieldTable& Fields();
};

class kbcC_AccelerationBCState final : public kbcC_AccelerationStateOf<kbcC_AccelerationBCState> {
public:
    static constexpr cls_ClassInfo Class{"kbcC_AccelerationBCState",
                                         "accelerations and angular accelerations of nodes in one step"};
};

class kbcC_ConnAccelerationBCState final : public kbcC_AccelerationStateOf<kbcC_ConnAccelerationBCState> {
public:
    static constexpr cls_ClassInfo Class{"kbcC_ConnAccelerationBCState",
                                         "accelerations and angular accelerations of connectors in one step"};
};

/// A condition of class T on up to six components, its states of class S.
template <class T, class Base, class S>
class kbcC_MotionOf : public cls_RecordOf<T, Base> {
public:
    cls_Record* NewState(unsigned) const override { return new S(); }
    bool ModifiedNeedsOpNew(const cow_String& stepName) const override {
        return this->FreesComponent(stepName);
    }
};

/// The components of a displacement condition by name.
template <class Base>
class kbcC_DisplacementQueries : public Base {
public:
    auto GetU1State(const cow_String& step) const { return this->Component(step, 0).state; }
    auto GetU2State(const cow_String& step) const { return this->Component(step, 1).state; }
    auto GetU3State(const cow_String& step) const { return this->Component(step, 2).state; }
    auto GetUR1State(const cow_String& step) const { return this->Component(step, 3).state; }
    auto GetUR2State(const cow_String& step) const { return this->Component(step, 4).state; }
    auto GetUR3State(const cow_String& step) const { return this->Component(step, 5).state; }
    double GetU1Real(const cow_String& step) const { return this->Component(step, 0).real; }
    double GetU2Real(const cow_String& step) const { return this->Component(step, 1).real; }
    double GetU3Real(const cow_String& step) const { return this->Component(step, 2).real; }
    double GetUR1Real(const cow_String& step) const { return this->Component(step, 3).real; }
    double GetUR2Real(const cow_String& step) const { return this->Component(step, 4).real; }
    double GetUR3Real(const cow_String& step) const { return this->Component(step, 5).real; }
    double GetU1Imag(const cow_String& step) const { return this->Component(step, 0).imag; }
    double GetU2Imag(const cow_String& step) const { return this->Component(step, 1).imag; }
    double GetU3Imag(const cow_String& step) const { return this->Component(step, 2).imag; }
    double GetUR1Imag(const cow_String& step) const { return this->Component(step, 3).imag; }
    double GetUR2Imag(const cow_String& step) const { return this->Component(step, 4).imag; }
    double GetUR3Imag(const cow_String& step) const { return this->Component(step, 5).imag; }
};

/// The components of a velocity condition by name.
template <class Base>
class kbcC_VelocityQueries : public Base {
public:
    auto GetV1State(const cow_String& step) const { return this->Component(step, 0).state; }
    auto GetV2State(const cow_String& step) const { return this->Component(step, 1).state; }
    auto GetV3State(const cow_String& step) const { return this->Component(step, 2).state; }
    auto GetVR1State(const cow_String& step) const { return this->Component(step, 3).state; }
    auto GetVR2State(const cow_String& step) const { return this->Component(step, 4).state; }
    auto GetVR3State(const cow_String& step) const { return this->Component(step, 5).state; }
    double GetV1Real(const cow_String& step) const { return this->Component(step, 0).real; }
    double GetV2Real(const cow_String& step) const { return this->Component(step, 1).real; }
    double GetV3Real(const cow_String& step) const { return this->Component(step, 2).real; }
    double GetVR1Real(const cow_String& step) const { return this->Component(step, 3).real; }
    double GetVR2Real(const cow_String& step) const { return this->Component(step, 4).real; }
    double GetVR3Real(const cow_String& step) const { return this->Component(step, 5).real; }
};

/// The components of a acceleration condition by name.
template <class Base>
class kbcC_AccelerationQueries : public Base {
public:
    auto GetA1State(const cow_String& step) const { return this->Component(step, 0).state; }
    auto GetA2State(const cow_String& step) const { return this->Component(step, 1).state; }
    auto GetA3State(const cow_String& step) const { return this->Component(step, 2).state; }
    auto GetAR1State(const cow_String& step) const { return this->Component(step, 3).state; }
    auto GetAR2State(const cow_String& step) const { return this->Component(step, 4).state; }
    auto GetAR3State(const cow_String& step) const { return this->Component(step, 5).state; }
    double GetA1Real(const cow_String& step) const { return this->Component(step, 0).real; }
    double GetA2Real(const cow_String& step) const { return this->Component(step, 1).real; }
    double GetA3Real(const cow_String& step) const { return this->Component(step, 2).real; }
    double GetAR1Real(const cow_String& step) const { return this->Component(step, 3).real; }
    double GetAR2Real(const cow_String& step) const { return this->Component(step, 4).real; }
    double GetAR3Real(const cow_String& step) const { return this->Component(step, 5).real; }
};

/// Relative motions of connector elements.
class kbcC_ConnectorBC : public cls_AbstractRecordOf<kbcC_ConnectorBC, kbcC_BC> {
public:
    static constexpr cls_ClassInfo Class{"kbcC_ConnectorBC", "a prescribed relative motion of connectors"};

    cow_List<cow_String> connectors;
    bool fixed = false;

    static const cls_FieldTable& Fields();
};

class kbcC_DisplacementBC final
    : public kbcC_DisplacementQueries<kbcC_MotionOf<kbcC_DisplacementBC, kbcC_BC, kbcC_DisplacementBCState>> {
public:
    static constexpr cls_ClassInfo Class{"kbcC_DisplacementBC",
                                         "prescribed displacements and rotations of a node set", 0x2980005,
                                         "Displacement"};

    bool fixed = false;

    static const cls_FieldTable& Fields();
};

class kbcC_VelocityBC final
    : public kbcC_VelocityQueries<kbcC_MotionOf<kbcC_VelocityBC, kbcC_BC, kbcC_VelocityBCState>> {
public:
    static constexpr cls_ClassInfo Class{"kbcC_VelocityBC",
                                         "prescribed velocities and angular velocities of a node set",
                                         0x2980007, "Velocity"};
};

class kbcC_AccelerationBC final
    : public kbcC_AccelerationQueries<kbcC_MotionOf<kbcC_AccelerationBC, kbcC_BC, kbcC_AccelerationBCState>> {
public:
    static constexpr cls_ClassInfo Class{"kbcC_AccelerationBC",
                                         "prescribed accelerations and angular accelerations of a node set",
                                         0x2980009, "Acceleration"};
};

class kbcC_ConnDisplacementBC final
    : public kbcC_DisplacementQueries<
          kbcC_MotionOf<kbcC_ConnDisplacementBC, kbcC_ConnectorBC, kbcC_ConnDisplacementBCState>> {
public:
    static constexpr cls_ClassInfo Class{
        "kbcC_ConnDisplacementBC", "prescribed relative displacement of connectors in their local directions",
        0x2980024, "ConnectorDisplacement"};
};

class kbcC_ConnVelocityBC final
    : public kbcC_VelocityQueries<
          kbcC_MotionOf<kbcC_ConnVelocityBC, kbcC_ConnectorBC, kbcC_ConnVelocityBCState>> {
public:
    static constexpr cls_ClassInfo Class{
        "kbcC_ConnVelocityBC", "prescribed relative velocity of connectors in their local directions",
        0x2980026, "ConnectorVelocity"};
};

class kbcC_ConnAccelerationBC final
    : public kbcC_AccelerationQueries<
          kbcC_MotionOf<kbcC_ConnAccelerationBC, kbcC_ConnectorBC, kbcC_ConnAccelerationBCState>> {
public:
    static constexpr cls_ClassInfo Class{
        "kbcC_ConnAccelerationBC", "prescribed relative acceleration of connectors in their local directions",
        0x2980028, "ConnectorAcceleration"};
};

void cls_RegisterMotionConditionRecords(cls_ClassRegistrar& registrar);

#endif
