#ifndef QRX_STORE_KCOC_CONSTRAINT_H
#define QRX_STORE_KCOC_CONSTRAINT_H

#include "store_interface/regions/rgnC_Region.h"

class cls_ClassRegistrar;

/// A relation between degrees of freedom that holds through the whole analysis; held by name.
class kcoC_Constraint : public cls_AbstractRecordOf<kcoC_Constraint> {
public:
    static constexpr cls_ClassInfo Class{"kcoC_Constraint", "a relation between degrees of freedom",
                                         0x2B00001};

    /// The node sets that the constraint names as surfaces; each gets a node-based surface. Empty for most.
    virtual cow_List<rgnC_Region> ConstGetContactNodeSets() const { return {}; }
    /// Whether it joins the two sides of the model's cyclic sector; a tie can.
    virtual bool IsCyclic() const { return false; }
};

enum class calC_SymmetryTypeEnm : int { NONE = 0, CYCLIC = 1 };
const omu_EnumTable& omu_EnumTableOf(calC_SymmetryTypeEnm);

/// The sector of a model that is cyclic about an axis.
class ddb_ModelSectorDefinition final : public cls_RecordOf<ddb_ModelSectorDefinition> {
public:
    static constexpr cls_ClassInfo Class{"ddb_ModelSectorDefinition", "the sector of a cyclic model"};

    calC_SymmetryTypeEnm symmetryType = calC_SymmetryTypeEnm::NONE;
    int numberOfSectors = 1;
    g3d_Vector startPoint;
    g3d_Vector endPoint{0.0, 0.0, 1.0};

    calC_SymmetryTypeEnm GetSymmetryType() const { return symmetryType; }
    int GetNumberOfSectors() const { return numberOfSectors; }
    g3d_Vector GetStartPoint() const { return startPoint; }
    g3d_Vector GetEndPoint() const { return endPoint; }

    static const cls_FieldTable& Fields();
};

void cls_RegisterConstraintRecords(cls_ClassRegistrar& registrar);

#endif
