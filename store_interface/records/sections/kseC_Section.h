#ifndef QRX_STORE_KSEC_SECTION_H
#define QRX_STORE_KSEC_SECTION_H

#include "store_interface/records/cls_FieldTable.h"

class cls_ClassRegistrar;

/// What an element set is made of; held by name in the model's section map.
class kseC_Section : public cls_AbstractRecordOf<kseC_Section> {
public:
    static constexpr cls_ClassInfo Class{"kseC_Section", "what an element set is made of"};
};

/// A cross-section of beams; held by name in the model's profile map.
class kbpC_BeamProfile : public cls_AbstractRecordOf<kbpC_BeamProfile> {
public:
    static constexpr cls_ClassInfo Class{"kbpC_BeamProfile", "a cross-section of beams"};
};

/// Gasket elements: measures and the material, which gasket options turn into a gasket behaviour.
class kseC_GasketSection final : public cls_RecordOf<kseC_GasketSection, kseC_Section> {
public:
    static constexpr cls_ClassInfo Class{"kseC_GasketSection", "gasket elements"};

    double crossSection = 1.0;
    double initialGap = 0.0;
    double initialThickness = cls_UnsetDouble;
    double initialVoid = 0.0;
    double stabilizationStiffness = cls_UnsetDouble;
    cow_String materialName;

    static const cls_FieldTable& Fields();
};

/// Connector elements of the assembly: kind of connection and behaviour.
class kseC_ConnectorSection final : public cls_RecordOf<kseC_ConnectorSection, kseC_Section> {
public:
    static constexpr cls_ClassInfo Class{"kseC_ConnectorSection", "connector elements of the assembly"};

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

    AssembledTypeEnm assembledType = AssembledTypeEnm::NONE;
    TranslationalTypeEnm translationalType = TranslationalTypeEnm::NONE;
    RotationalTypeEnm rotationalType = RotationalTypeEnm::NONE;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kseC_ConnectorSection::AssembledTypeEnm);
const omu_EnumTable& omu_EnumTableOf(kseC_ConnectorSection::TranslationalTypeEnm);
const omu_EnumTable& omu_EnumTableOf(kseC_ConnectorSection::RotationalTypeEnm);

void cls_RegisterSectionRecords(cls_ClassRegistrar& registrar);

#endif
