#ifndef QRX_STORE_KSEC_CONNECTORSECTION_H
#define QRX_STORE_KSEC_CONNECTORSECTION_H

#include "store_interface/records/sections/kbeC_ConnectorBehavior.h"
#include "store_interface/records/sections/kseC_Section.h"

class cls_ClassRegistrar;

class kseC_ConnectorSection final : public cls_RecordOf<kseC_ConnectorSection, kseC_Section> {
public:
    static constexpr cls_ClassInfo Class{
        "kseC_ConnectorSection", "Connector elements of the assembly: kind of connection and behaviour.", 0,
        "Connector"};

    enum class AssembledTypeEnm : int {
        NONE = 0,
        BEAM = 1,
        BUSHING = 2,
        CVJOINT = 3,
        CYLINDRICAL = 4,
        HINGE = 5,
        PLANAR = 6,
        RETRACTOR = 7,
        SLIPRING = 8,
        TRANSLATOR = 9,
        UJOINT = 10,
        WELD = 11
    };
    enum class TranslationalTypeEnm : int {
        NONE = 0,
        ACCELEROMETER = 1,
        AXIAL = 2,
        CARTESIAN = 3,
        JOIN = 4,
        LINK = 5,
        PROJECTION_CARTESIAN = 6,
        RADIAL_THRUST = 7,
        SLIDE_PLANE = 8,
        SLOT = 9
    };
    enum class RotationalTypeEnm : int {
        NONE = 0,
        ALIGN = 1,
        CARDAN = 2,
        CONSTANT_VELOCITY = 3,
        EULER = 4,
        FLEXION_TORSION = 5,
        FLOW_CONVERTER = 6,
        PROJECTION_FLEXION_TORSION = 7,
        REVOLUTE = 8,
        ROTATION = 9,
        ROTATION_ACCELEROMETER = 10,
        UNIVERSAL = 11
    };

    /// Six unset items.
    static cow_List<double> constitutiveReferenceDef();

    static constexpr double contactAngleDef() { return cls_UnsetDouble; }
    static constexpr double materialFlowFactorDef() { return 1.0; }
    static constexpr double regularizationDef() { return 0.03; }

    AssembledTypeEnm assembledType = AssembledTypeEnm::NONE;
    TranslationalTypeEnm translationalType = TranslationalTypeEnm::NONE;
    RotationalTypeEnm rotationalType = RotationalTypeEnm::NONE;
    bool regularize = true;
    bool useBehaviorRegularization = false;
    double regularization = regularizationDef();
    bool extrapolationLinear = false;
    bool integrationExplicit = false;
    double contactAngle = contactAngleDef();
    double materialFlowFactor = materialFlowFactorDef();
    double massPerLength = 0.0;
    /// Unset items are -DBL_MAX.
    cow_List<double> constitutiveReference = constitutiveReferenceDef();
    cow_List<mdl_ObjCow<kbeC_ConnectorBehaviorOption>> options;

    /// The text of the assembled type; else those of the two basic types, joined by " + ". Empty without any.
    cow_String GetConnectionTypeAsString() const;

    static const cls_FieldTable& Fields();
};

class kseC_Utils {
public:
    /// No behaviour option and no reference value: there is no behaviour block to write. Flags don't count.
    static bool IsConnectorSectionEmpty(const kseC_ConnectorSection& section);
};

const omu_EnumTable& omu_EnumTableOf(kseC_ConnectorSection::AssembledTypeEnm);
const omu_EnumTable& omu_EnumTableOf(kseC_ConnectorSection::TranslationalTypeEnm);
const omu_EnumTable& omu_EnumTableOf(kseC_ConnectorSection::RotationalTypeEnm);

void cls_RegisterConnectorSectionRecords(cls_ClassRegistrar& registrar);

#endif
