#ifndef QRX_STORE_KINC_CONTACT_H
#define QRX_STORE_KINC_CONTACT_H

#include "store_interface/records/interactions/kinC_Interaction.h"

/// Kind of the initial clearance of a contact pair: whether *Clearance is written, and in what form.
enum class kinC_ClearanceTypeEnm : int { NONE = 0, BOLT = 1, SINGLE_VALUE = 2 };
const omu_EnumTable& omu_EnumTableOf(kinC_ClearanceTypeEnm);

/// Initial adjustment of slave nodes.
enum class kinC_StdAdjustEnm : int { NONE = 0, ZERO = 1, TOLERANCE = 2, SET = 3 };
const omu_EnumTable& omu_EnumTableOf(kinC_StdAdjustEnm);

/// Kind of interference fit.
enum class kinC_InterferenceTypeEnm : int { NONE = 0, SHRINK_FIT = 1, UNIFORM_FIT = 2 };
const omu_EnumTable& omu_EnumTableOf(kinC_InterferenceTypeEnm);

/// How the direction of an interference fit is found.
enum class kinC_InterferenceDirectionTypeEnm : int { COMPUTED = 0, SPECIFIED = 1 };
const omu_EnumTable& omu_EnumTableOf(kinC_InterferenceDirectionTypeEnm);

class cls_ClassRegistrar;

/// State of a contact pair in one step: of two surfaces, or of one with itself.
class kinC_ContactPairState : public cls_RecordOf<kinC_ContactPairState, kinC_InteractionState> {
public:
    static constexpr cls_ClassInfo Class{
        "kinC_ContactPairState",
        "state of a contact pair in one step: which property and which controls are in force"};

    bool opDelete = false;
    mdl_PropAttr<cow_String> InteractionProperty;
    mdl_PropAttr<cow_String> ContactControls;

    static const cls_FieldTable& Fields();
};

/// Contact of two surfaces, or of one with itself.
class kinC_ContactPair : public cls_AbstractRecordOf<kinC_ContactPair, kinC_Interaction> {
public:
    static constexpr cls_ClassInfo Class{"kinC_ContactPair",
                                         "contact of two surfaces, or of one with itself"};

    const kinC_ContactPairState& ConstGetState(const cow_String& stepName) const {
        return static_cast<const kinC_ContactPairState&>(kinC_Interaction::ConstGetState(stepName));
    }
    virtual const rgnC_Region& MasterSurface() const = 0;
    virtual const rgnC_Region& SlaveSurface() const = 0;

protected:
    /// opDelete is true in the step that ends the pair unless given, and is never carried over.
    void CompleteState(cls_Record& state, mdl_PropagationStatusEnm status,
                       const mdl_GivenState* given) const override;
};

class kinC_SurfaceToSurfaceContactState
    : public cls_RecordOf<kinC_SurfaceToSurfaceContactState, kinC_ContactPairState> {
public:
    static constexpr cls_ClassInfo Class{
        "kinC_SurfaceToSurfaceContactState",
        "state of a surface-to-surface contact in one step: which property and which controls are in force",
        0x2A00013};
};

class kinC_SurfaceToSurfaceContact
    : public cls_AbstractRecordOf<kinC_SurfaceToSurfaceContact, kinC_ContactPair> {
public:
    static constexpr cls_ClassInfo Class{"kinC_SurfaceToSurfaceContact",
                                         "contact between two surfaces, for either solver", 0x2A00012};

    static constexpr double initialClearanceDef() { return cls_UnsetDouble; }
    static constexpr double majorBoltDiameterDef() { return cls_UnsetDouble; }
    static constexpr double meanBoltDiameterDef() { return cls_UnsetDouble; }
    rgnC_Region master;
    rgnC_Region slave;
    int sliding = 1;
    double initialClearance = initialClearanceDef();
    double halfThreadAngle = 0.0;
    double pitch = 0.0;
    double majorBoltDiameter = majorBoltDiameterDef();
    double meanBoltDiameter = meanBoltDiameterDef();
    rgnC_Region clearanceRegion;
    kinC_ClearanceTypeEnm clearanceType = kinC_ClearanceTypeEnm::NONE;

    kinC_ClearanceTypeEnm ClearanceType() const { return clearanceType; }
    const rgnC_Region& MasterSurface() const override { return master; }
    const rgnC_Region& SlaveSurface() const override { return slave; }

    static const cls_FieldTable& Fields();

protected:
    cow_List<rgnC_Region> ContactSurfaces() const override { return {master, slave}; }
};

class kinC_SurfaceToSurfaceContactStdState final
    : public cls_RecordOf<kinC_SurfaceToSurfaceContactStdState, kinC_SurfaceToSurfaceContactState> {
public:
    static constexpr cls_ClassInfo Class{
        "kinC_SurfaceToSurfaceContactStdState",
        "state of an implicit surface-to-surface contact in one step, with its interference fit", 0x2A00015};

    mdl_PropAttr<kinC_InterferenceTypeEnm> interferenceType;
    mdl_PropAttr<double> interferenceValue;
    mdl_PropAttr<kinC_InterferenceDirectionTypeEnm> directionType;
    mdl_PropAttr<cow_List<float>> direction{{0.0F, 0.0F, 0.0F}, mdl_PropAttributeStateEnm::NEVER_SET};
    mdl_PropAttr<cow_String> amplitude;

    static const cls_FieldTable& Fields();
};

class kinC_SurfaceToSurfaceContactStd final
    : public kinC_InteractionOf<kinC_SurfaceToSurfaceContactStd, kinC_SurfaceToSurfaceContactStdState,
                                kinC_SurfaceToSurfaceContact> {
public:
    static constexpr cls_ClassInfo Class{"kinC_SurfaceToSurfaceContactStd",
                                         "contact between two surfaces in the implicit solver", 0x2A00014,
                                         "SurfaceToSurfaceContactStandard StandardContact"};

    static constexpr kinC_StdAdjustEnm adjustDef() { return kinC_StdAdjustEnm::NONE; }
    static constexpr double smoothDef() { return 0.2; }
    static constexpr double extensionZoneDef() { return 0.1; }
    kinC_StdAdjustEnm adjust = adjustDef();
    double adjustTolerance = 0.0;
    rgnC_Region adjustRegion;
    int formulation = 0;
    bool thickness = true;
    double smooth = smoothDef();
    bool tied = false;
    bool autoHcrit = true;
    double hcrit = 0.0;
    bool limitSlideDistance = false;
    double slideDistance = 0.0;
    double extensionZone = extensionZoneDef();
    cow_String geometricCorrection;

    static const cls_FieldTable& Fields();
};

class kinC_SurfaceToSurfaceContactXplState final
    : public cls_RecordOf<kinC_SurfaceToSurfaceContactXplState, kinC_SurfaceToSurfaceContactState> {
public:
    static constexpr cls_ClassInfo Class{"kinC_SurfaceToSurfaceContactXplState",
                                         "state of an explicit surface-to-surface contact in one step",
                                         0x2A00017};

    static const cls_FieldTable& Fields();
};

class kinC_SurfaceToSurfaceContactXpl final
    : public kinC_InteractionOf<kinC_SurfaceToSurfaceContactXpl, kinC_SurfaceToSurfaceContactXplState,
                                kinC_SurfaceToSurfaceContact> {
public:
    static constexpr cls_ClassInfo Class{"kinC_SurfaceToSurfaceContactXpl",
                                         "contact between two surfaces in the explicit solver", 0x2A00016,
                                         "SurfaceToSurfaceContactExplicit ExplicitContact"};

    int mechanicalConstraint = 0;
    int weightingChoice = 0;
    double weight = 0.5;

    static const cls_FieldTable& Fields();
};

class kinC_SelfContactState : public cls_RecordOf<kinC_SelfContactState, kinC_ContactPairState> {
public:
    static constexpr cls_ClassInfo Class{
        "kinC_SelfContactState",
        "state of a self contact in one step: which property and which controls are in force", 0x2A00019};
};

class kinC_SelfContact : public cls_AbstractRecordOf<kinC_SelfContact, kinC_ContactPair> {
public:
    static constexpr cls_ClassInfo Class{"kinC_SelfContact",
                                         "contact of one surface with itself, for either solver", 0x2A00018};

    rgnC_Region surface;

    const rgnC_Region& MasterSurface() const override { return surface; }
    const rgnC_Region& SlaveSurface() const override { return surface; }

    static const cls_FieldTable& Fields();

protected:
    cow_List<rgnC_Region> ContactSurfaces() const override { return cow_List<rgnC_Region>(surface); }
};

class kinC_SelfContactStdState final : public cls_RecordOf<kinC_SelfContactStdState, kinC_SelfContactState> {
public:
    static constexpr cls_ClassInfo Class{"kinC_SelfContactStdState",
                                         "state of an implicit self contact in one step", 0x2A0001B};

    static const cls_FieldTable& Fields();
};

class kinC_SelfContactStd final
    : public kinC_InteractionOf<kinC_SelfContactStd, kinC_SelfContactStdState, kinC_SelfContact> {
public:
    static constexpr cls_ClassInfo Class{"kinC_SelfContactStd",
                                         "contact of a surface with itself in the implicit solver", 0x2A0001A,
                                         "SelfContactStandard"};

    static constexpr double smoothDef() { return 0.2; }
    int formulation = 0;
    bool thickness = true;
    double smooth = smoothDef();

    static const cls_FieldTable& Fields();
};

class kinC_SelfContactXplState final : public cls_RecordOf<kinC_SelfContactXplState, kinC_SelfContactState> {
public:
    static constexpr cls_ClassInfo Class{"kinC_SelfContactXplState",
                                         "state of an explicit self contact in one step", 0x2A0001D};

    static const cls_FieldTable& Fields();
};

class kinC_SelfContactXpl final
    : public kinC_InteractionOf<kinC_SelfContactXpl, kinC_SelfContactXplState, kinC_SelfContact> {
public:
    static constexpr cls_ClassInfo Class{"kinC_SelfContactXpl",
                                         "contact of a surface with itself in the explicit solver", 0x2A0001C,
                                         "SelfContactExplicit"};

    int mechanicalConstraint = 0;

    static const cls_FieldTable& Fields();
};

void cls_RegisterContactRecords(cls_ClassRegistrar& registrar);

#endif
