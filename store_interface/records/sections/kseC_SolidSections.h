#ifndef QRX_STORE_KSEC_SOLIDSECTIONS_H
#define QRX_STORE_KSEC_SOLIDSECTIONS_H

#include "store_interface/records/sections/kseC_Section.h"

class cls_ClassRegistrar;

class kseC_SolidSection : public cls_AbstractRecordOf<kseC_SolidSection, kseC_Section> {
public:
    static constexpr cls_ClassInfo Class{"kseC_SolidSection", "continuum elements"};
};

class kseC_HomogenousSolidSection final
    : public cls_RecordOf<kseC_HomogenousSolidSection, kseC_SolidSection> {
public:
    static constexpr cls_ClassInfo Class{"kseC_HomogenousSolidSection", "continuum elements of one material",
                                         0, "SolidSection HomogeneousSolidSection"};

    double thickness = 1.0;
    cow_String materialName;

    cow_String MaterialName() const override { return materialName; }

    static const cls_FieldTable& Fields();
};

class kseC_CompositeSolidLayer final : public cls_RecordOf<kseC_CompositeSolidLayer> {
public:
    static constexpr cls_ClassInfo Class{"kseC_CompositeSolidLayer",
                                         "one layer of a composite continuum section"};

    double thickness = 1.0;
    int integrationPoints = 1;
    cow_String materialName;
    double orientationAngle = 0.0;

    static const cls_FieldTable& Fields();
};

class kseC_CompositeSolidSection final : public cls_RecordOf<kseC_CompositeSolidSection, kseC_SolidSection> {
public:
    static constexpr cls_ClassInfo Class{"kseC_CompositeSolidSection", "continuum elements of stacked layers",
                                         0, "CompositeSolid"};

    bool symmetric = false;
    cow_List<kseC_CompositeSolidLayer> layers;

    static const cls_FieldTable& Fields();
};

class kseC_TrussSection final : public cls_RecordOf<kseC_TrussSection, kseC_Section> {
public:
    static constexpr cls_ClassInfo Class{"kseC_TrussSection", "truss elements", 0, "Truss"};

    double area = 1.0;
    cow_String materialName;

    cow_String MaterialName() const override { return materialName; }

    static const cls_FieldTable& Fields();
};

class kseC_MembraneSection final : public cls_RecordOf<kseC_MembraneSection, kseC_Section> {
public:
    static constexpr cls_ClassInfo Class{"kseC_MembraneSection", "membrane elements", 0, "Membrane"};

    enum class PoissonDefinitionEnm : int { DEFAULT = 0, VALUE = 1 };

    static constexpr PoissonDefinitionEnm poissonDefinitionDef() { return PoissonDefinitionEnm::DEFAULT; }

    double thickness = 1.0;
    PoissonDefinitionEnm poissonDefinition = poissonDefinitionDef();
    double poisson = 0.5;
    cow_String materialName;

    cow_String MaterialName() const override { return materialName; }

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kseC_MembraneSection::PoissonDefinitionEnm);

class kseC_GasketSection final : public cls_RecordOf<kseC_GasketSection, kseC_Section> {
public:
    static constexpr cls_ClassInfo Class{"kseC_GasketSection", "gasket elements", 0, "Gasket"};

    static constexpr double initialThicknessDef() { return cls_UnsetDouble; }
    static constexpr double stabilizationStiffnessDef() { return cls_UnsetDouble; }

    double crossSection = 1.0;
    double initialGap = 0.0;
    double initialThickness = initialThicknessDef();
    double initialVoid = 0.0;
    double stabilizationStiffness = stabilizationStiffnessDef();
    cow_String materialName;

    cow_String MaterialName() const override { return materialName; }

    static const cls_FieldTable& Fields();
};

void cls_RegisterSolidSectionRecords(cls_ClassRegistrar& registrar);

#endif
