#ifndef QRX_STORE_KINC_CYCLICSYMMETRY_H
#define QRX_STORE_KINC_CYCLICSYMMETRY_H

#include "store_interface/records/interactions/kinC_Interaction.h"

class cls_ClassRegistrar;

class kinC_CyclicSymmetryState final : public cls_RecordOf<kinC_CyclicSymmetryState, kinC_InteractionState> {
public:
    static constexpr cls_ClassInfo Class{"kinC_CyclicSymmetryState",
                                         "state of a cyclic symmetry interaction in one step", 0x2A0002F};

    mdl_PropAttr<int> cyclicMode;

    static const cls_FieldTable& Fields();
};

class kinC_CyclicSymmetry final : public kinC_InteractionOf<kinC_CyclicSymmetry, kinC_CyclicSymmetryState> {
public:
    static constexpr cls_ClassInfo Class{"kinC_CyclicSymmetry",
                                         "cyclic symmetry of the model: the mode that the loads of a step "
                                         "excite; writes nothing of its own",
                                         0x2A0002E};
};

class kinC_ElasticFoundation final
    : public kinC_InteractionOf<kinC_ElasticFoundation, kinC_InteractionState> {
public:
    static constexpr cls_ClassInfo Class{"kinC_ElasticFoundation",
                                         "elastic support of a surface; no deck carries it", 0x2A00026,
                                         "Foundation"};
};

void cls_RegisterCyclicSymmetryRecords(cls_ClassRegistrar& registrar);

#endif
