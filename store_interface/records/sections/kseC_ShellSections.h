#ifndef QRX_STORE_KSEC_SHELLSECTIONS_H
#define QRX_STORE_KSEC_SHELLSECTIONS_H

#include "store_interface/records/sections/kseC_Section.h"

class cls_ClassRegistrar;

class kseC_ShellSection : public cls_AbstractRecordOf<kseC_ShellSection, kseC_Section> {
public:
    static constexpr cls_ClassInfo Class{"kseC_ShellSection", "shell elements"};
};

class kseC_RebarLayer final : public cls_RecordOf<kseC_RebarLayer> {
public:
    static constexpr cls_ClassInfo Class{"kseC_RebarLayer", "one rebar layer"};

    double area = 0.0;
    cow_String orientationName;
    double orientationAngle = 0.0;
    double spacing = 0.0;
    double position = 0.0;
    double angularSpacing = 0.0;
    cow_String name;
    cow_String materialName;

    static const cls_FieldTable& Fields();
};

class kseC_RebarLayers final : public cls_RecordOf<kseC_RebarLayers> {
public:
    static constexpr cls_ClassInfo Class{"kseC_RebarLayers", "the rebar layers of a shell"};

    enum class SpacingTypeEnm : int { CONSTANT = 0, ANGULAR = 1 };

    SpacingTypeEnm spacingType = SpacingTypeEnm::CONSTANT;
    cow_List<kseC_RebarLayer> layers;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kseC_RebarLayers::SpacingTypeEnm);

class kseC_TransverseShearShell final : public cls_RecordOf<kseC_TransverseShearShell> {
public:
    static constexpr cls_ClassInfo Class{"kseC_TransverseShearShell",
                                         "transverse shear stiffness given for a shell"};

    double k11 = 0.0;
    double k22 = 0.0;
    double k12 = 0.0;

    static const cls_FieldTable& Fields();
};

class kseC_GeometryShellSection : public cls_AbstractRecordOf<kseC_GeometryShellSection, kseC_ShellSection> {
public:
    static constexpr cls_ClassInfo Class{"kseC_GeometryShellSection",
                                         "shells whose stiffness follows from thickness and material"};

    enum class PoissonDefinitionEnm : int { DEFAULT = 0, VALUE = 1 };
    enum class IntegrationRuleEnm : int { SIMPSON = 0, GAUSS = 1 };
    enum class TemperatureModeEnm : int { GRADIENT = 0, POINTWISE = 1 };

    static constexpr IntegrationRuleEnm integrationRuleDef() { return IntegrationRuleEnm::SIMPSON; }
    static constexpr PoissonDefinitionEnm poissonDefinitionDef() { return PoissonDefinitionEnm::DEFAULT; }
    static constexpr double thicknessModulusDef() { return cls_UnsetDouble; }

    bool useGeneralKeyword = false;
    PoissonDefinitionEnm poissonDefinition = poissonDefinitionDef();
    double poisson = 0.5;
    IntegrationRuleEnm integrationRule = integrationRuleDef();
    TemperatureModeEnm temperatureMode = TemperatureModeEnm::GRADIENT;
    int temperaturePoints = 3;
    double thicknessModulus = thicknessModulusDef();
    mdl_ObjCow<kseC_RebarLayers> rebars;
    mdl_ObjCow<kseC_TransverseShearShell> transverseShear;

    bool HasRebar() const override;
    bool UsesRebarOrientation() const override;
    void AddUserOrientations(cow_List<cow_String>& names) const override;
    int NumTempPoints(bool) const override;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kseC_GeometryShellSection::PoissonDefinitionEnm);
const omu_EnumTable& omu_EnumTableOf(kseC_GeometryShellSection::IntegrationRuleEnm);
const omu_EnumTable& omu_EnumTableOf(kseC_GeometryShellSection::TemperatureModeEnm);

class kseC_HomogenousShellSection final
    : public cls_RecordOf<kseC_HomogenousShellSection, kseC_GeometryShellSection> {
public:
    static constexpr cls_ClassInfo Class{"kseC_HomogenousShellSection", "shell of one material", 0,
                                         "ShellSection HomogeneousShellSection"};

    double thickness = 0.0;
    int integrationPoints = 5;
    cow_String materialName;

    cow_String MaterialName() const override { return materialName; }

    static const cls_FieldTable& Fields();
};

class kseC_CompositeShellLayer final : public cls_RecordOf<kseC_CompositeShellLayer> {
public:
    static constexpr cls_ClassInfo Class{"kseC_CompositeShellLayer", "one layer of a composite shell"};

    double thickness = 0.0;
    int integrationPoints = 3;
    cow_String materialName;
    cow_String orientationName;
    double orientationAngle = 0.0;

    static const cls_FieldTable& Fields();
};

class kseC_CompositeShellSection final
    : public cls_RecordOf<kseC_CompositeShellSection, kseC_GeometryShellSection> {
public:
    static constexpr cls_ClassInfo Class{"kseC_CompositeShellSection", "shell of stacked layers", 0,
                                         "CompositeShell"};

    cow_List<kseC_CompositeShellLayer> layers;

    void AddUserOrientations(cow_List<cow_String>& names) const override;

    static const cls_FieldTable& Fields();
};

class kseC_GeneralShellSection final : public cls_RecordOf<kseC_GeneralShellSection, kseC_ShellSection> {
public:
    static constexpr cls_ClassInfo Class{"kseC_GeneralShellSection",
                                         "shell of given stiffness; no deck can be written of it", 0,
                                         "GeneralShell"};
};

class kseC_UserShellSection final : public cls_RecordOf<kseC_UserShellSection, kseC_ShellSection> {
public:
    static constexpr cls_ClassInfo Class{
        "kseC_UserShellSection", "shell whose behaviour comes from user code; no deck can be written of it",
        0, "UserShell"};

    bool symmetric = true;

    static const cls_FieldTable& Fields();
};

void cls_RegisterShellSectionRecords(cls_ClassRegistrar& registrar);

#endif
