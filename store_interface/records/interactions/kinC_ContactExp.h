#ifndef QRX_STORE_KINC_CONTACTEXP_H
#define QRX_STORE_KINC_CONTACTEXP_H

#include "store_interface/records/interactions/kinC_Interaction.h"

class cls_ClassRegistrar;

class kinC_SurfacePair final : public cls_RecordOf<kinC_SurfacePair> {
public:
    static constexpr cls_ClassInfo Class{"kinC_SurfacePair",
                                         "one entry of a general contact list: two surfaces"};

    rgnC_Region first;
    rgnC_Region second;

    static const cls_FieldTable& Fields();
};

class kinC_SurfThick final : public cls_RecordOf<kinC_SurfThick> {
public:
    static constexpr cls_ClassInfo Class{
        "kinC_SurfThick", "surface thickness of a general contact surface property assignment"};

    int type = 0;
    double value = 0.0;
    double scale = 1.0;

    static const cls_FieldTable& Fields();
};

class kinC_MasterSlave final : public cls_RecordOf<kinC_MasterSlave> {
public:
    static constexpr cls_ClassInfo Class{
        "kinC_MasterSlave", "role of the first surface of a general contact formulation assignment"};

    enum class MasterSlaveEnm : int { MASTER = 0, SLAVE = 1, BALANCED = 2 };

    MasterSlaveEnm masterSlave = MasterSlaveEnm::MASTER;

    static const cls_FieldTable& Fields();
};
const omu_EnumTable& omu_EnumTableOf(kinC_MasterSlave::MasterSlaveEnm);

class kinC_ContactExpState final : public cls_RecordOf<kinC_ContactExpState, kinC_InteractionState> {
public:
    static constexpr cls_ClassInfo Class{
        "kinC_ContactExpState",
        "state of a general contact in one step: entry i of each list belongs "
        "to entry i of the matching pair list of the interaction",
        0x2A00034};

    mdl_PropAttr<bool> wholeModelContact;
    cow_List<mdl_PropAttr<bool>> inclusions;
    cow_List<mdl_PropAttr<bool>> exclusions;
    cow_List<mdl_PropAttr<cow_String>> propertyAssignments;
    cow_List<mdl_PropAttr<kinC_SurfThick>> surfacePropertyAssignments;
    cow_List<mdl_PropAttr<kinC_MasterSlave>> formulationAssignments;

    static const cls_FieldTable& Fields();
};

class kinC_ContactExp final : public kinC_InteractionOf<kinC_ContactExp, kinC_ContactExpState> {
public:
    static constexpr cls_ClassInfo Class{"kinC_ContactExp",
                                         "general contact: contact among many surfaces at once, by lists of "
                                         "included and excluded pairs and assignments",
                                         0x2A00033, "GeneralContact"};

    cow_List<kinC_SurfacePair> inclusionPairs;
    cow_List<kinC_SurfacePair> exclusionPairs;
    cow_List<kinC_SurfacePair> propertyAssignmentPairs;
    cow_List<kinC_SurfacePair> surfacePropertyAssignmentPairs;
    cow_List<kinC_SurfacePair> formulationAssignmentPairs;

    /// The whole exterior of the model is in contact, whatever the state of the attribute is.
    bool WholeModelContact(const cow_String& stepName) const {
        return ConstGetState(stepName).wholeModelContact.ConstGet();
    }

    static const cls_FieldTable& Fields();

protected:
    cow_List<rgnC_Region> ContactSurfaces() const override;
};

void cls_RegisterGeneralContactRecords(cls_ClassRegistrar& registrar);

#endif
