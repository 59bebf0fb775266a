#ifndef QRX_STORE_KSEC_BEAMSECTION_H
#define QRX_STORE_KSEC_BEAMSECTION_H

#include "store_interface/records/sections/kseC_Section.h"

class cls_ClassRegistrar;

class kseC_TransverseShearBeam final : public cls_RecordOf<kseC_TransverseShearBeam> {
public:
    static constexpr cls_ClassInfo Class{
        "kseC_TransverseShearBeam",
        "transverse shear stiffness given for a beam; for programs, as no section holds one"};

    double k11 = 0.0;
    double k22 = 0.0;

    static const cls_FieldTable& Fields();
};

class kseC_BeamSection final : public cls_RecordOf<kseC_BeamSection, kseC_Section> {
public:
    static constexpr cls_ClassInfo Class{
        "kseC_BeamSection", "beam elements: profile, material or material constants, and options", 0, "Beam"};

    enum class IntegrationEnm : int { BEFORE_ANALYSIS = 0, DURING_ANALYSIS = 1 };
    enum class TemperatureVarEnm : int { GRADIENTS = 0, VALUES = 1 };
    enum class FluidInertiaEnm : int { FULL = 0, HALF = 1 };

    IntegrationEnm integration = IntegrationEnm::DURING_ANALYSIS;
    double poisson = cls_UnsetDouble;
    bool temperatureDependency = false;
    bool useFieldColumn = false;
    int dependencies = 0;
    double density = cls_UnsetDouble;
    double referenceTemperature = cls_UnsetDouble;
    TemperatureVarEnm temperatureVar = TemperatureVarEnm::GRADIENTS;
    double alphaDamping = 0.0;
    double betaDamping = 0.0;
    double compositeDamping = 0.0;
    bool useFluidInertia = false;
    FluidInertiaEnm fluidInertiaHalf = FluidInertiaEnm::FULL;
    double fluidValue1 = 0.0;
    double fluidValue2 = 0.0;
    double fluidValue3 = 1.0;
    double fluidValue4 = 0.0;
    double fluidValue5 = 0.0;
    double fluidValue6 = 0.0;
    cow_String profileName;
    cow_String materialName;
    cow_2DArray<double> materialTable;
    cow_2DArray<double> sectionPoints;
    cow_List<double> centroid;
    cow_List<double> shearCenter;

    cow_String MaterialName() const override { return materialName; }

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kseC_BeamSection::IntegrationEnm);
const omu_EnumTable& omu_EnumTableOf(kseC_BeamSection::TemperatureVarEnm);
const omu_EnumTable& omu_EnumTableOf(kseC_BeamSection::FluidInertiaEnm);

void cls_RegisterBeamSectionRecords(cls_ClassRegistrar& registrar);

#endif
