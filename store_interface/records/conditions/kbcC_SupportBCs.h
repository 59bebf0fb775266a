#ifndef QRX_STORE_KBCC_SUPPORTBCS_H
#define QRX_STORE_KBCC_SUPPORTBCS_H

#include "store_interface/records/conditions/kbcC_BC.h"

class cls_ClassRegistrar;

class kbcC_TypeBC final : public cls_RecordOf<kbcC_TypeBC, kbcC_BC> {
public:
    static constexpr cls_ClassInfo Class{
        "kbcC_TypeBC",
        "a node set held by a named support: symmetry, antisymmetry, pinned, "
        "clamped, or the restraint of a pipe section",
        0x298000C, "Support"};

    /// The texts are the words of the deck.
    enum class TypeNameEnm : int {
        XSYMM = 0,
        YSYMM = 1,
        ZSYMM = 2,
        XASYMM = 3,
        YASYMM = 4,
        ZASYMM = 5,
        PINNED = 6,
        ENCASTRE = 7,
        NOWARP = 8,
        NOOVAL = 9,
        NODEFORM = 10
    };

    cls_Record* NewState(unsigned procedureType) const override;
    /// Another support frees what the old one held.
    bool ModifiedNeedsOpNew(const cow_String& stepName) const override;
};
const omu_EnumTable& omu_EnumTableOf(kbcC_TypeBC::TypeNameEnm);

class kbcC_TypeBCState final : public cls_RecordOf<kbcC_TypeBCState, kbcC_BCState> {
public:
    static constexpr cls_ClassInfo Class{"kbcC_TypeBCState", "kind of support in one step"};

    mdl_PropAttr<kbcC_TypeBC::TypeNameEnm> typeName;
    int buckleCase = 0;

    int BuckleCase() const override { return buckleCase; }

    static const cls_FieldTable& Fields();
};

class kbcC_SymmetryBC final : public cls_RecordOf<kbcC_SymmetryBC, kbcC_BC> {
public:
    static constexpr cls_ClassInfo Class{"kbcC_SymmetryBC",
                                         "a symmetry record without degrees of freedom of its own: a fixed "
                                         "text in the deck",
                                         0x298000E};

    cls_Record* NewState(unsigned) const override { return new kbcC_BCState(); }
};

class kbcC_SubmodelBCState final : public cls_RecordOf<kbcC_SubmodelBCState, kbcC_BCState> {
public:
    static constexpr cls_ClassInfo Class{"kbcC_SubmodelBCState", "what drives a submodel in one step"};

    static constexpr bool timeScaleDef() { return false; }

    mdl_PropAttr<bool> centerZone;
    mdl_PropAttr<cow_List<int>> dofs;
    mdl_PropAttr<double> shellThicknessValue;
    cow_String stepName;
    int increment = 0;
    bool timeScale = timeScaleDef();

    static const cls_FieldTable& Fields();
};

class kbcC_SubmodelBC final : public cls_RecordOf<kbcC_SubmodelBC, kbcC_BC> {
public:
    static constexpr cls_ClassInfo Class{"kbcC_SubmodelBC",
                                         "boundary of a submodel, driven by the results of a global model",
                                         0x2980022, "Submodel"};

    cow_String globalElset;
    double shellThickness = 0.0;
    double absoluteExteriorTolerance = 0.0;
    double exteriorTolerance = 0.05;

    cls_Record* NewState(unsigned) const override { return new kbcC_SubmodelBCState(); }
    const kbcC_SubmodelBCState& SubmodelState(const cow_String& step) const {
        return static_cast<const kbcC_SubmodelBCState&>(ConstGetStateQuad(step).state.ConstGet());
    }
    /// Whether the global model drives the boundary in a step of the status: 1, 2, 3, 9 or 10.
    static bool IsSubmodelActive(mdl_PropagationStatusEnm status);
    /// A degree of freedom that is dropped from the list has to be freed.
    bool ModifiedNeedsOpNew(const cow_String& stepName) const override {
        return SubmodelState(stepName).dofs.IsModified();
    }

    static const cls_FieldTable& Fields();
};

void cls_RegisterSupportConditionRecords(cls_ClassRegistrar& registrar);

#endif
