#ifndef QRX_STORE_KORC_OUTPUT_H
#define QRX_STORE_KORC_OUTPUT_H

#include "store_interface/model/rgnC_Region.h"
#include "store_interface/propagation/kprC_PropagatingObject.h"

/// What an output request asks for in one step.
class korC_OutputState : public cls_AbstractRecordOf<korC_OutputState> {
public:
    static constexpr cls_ClassInfo Class{"korC_OutputState", "what an output request asks for in one step"};
};

/// From where in the model results are wanted; held by name.
class korC_Output : public kprC_PropagatingOf<korC_Output, korC_OutputState> {
public:
    static constexpr cls_ClassInfo Class{"korC_Output", "an output request"};

    mdl_PropagationFamilyEnm Family() const override { return mdl_PropagationFamilyEnm::OUTPUT_REQUEST; }
    /// Status 1, 2, 3, 4, 8, 9, 10, 11 or 14.
    bool HasStep(const cow_String& stepName) const;
};

/// Results over a region at a few moments.
class korC_FieldOutput : public cls_AbstractRecordOf<korC_FieldOutput, korC_Output> {
public:
    static constexpr cls_ClassInfo Class{"korC_FieldOutput", "a request for field output"};
};

/// Results at a few points, or of the whole model, at many moments.
class korC_HistoryOutput : public cls_AbstractRecordOf<korC_HistoryOutput, korC_Output> {
public:
    static constexpr cls_ClassInfo Class{"korC_HistoryOutput", "a request for history output"};
};

/// A named section over which forces are summed.
class korC_IntegratedOutputSection : public cls_AbstractRecordOf<korC_IntegratedOutputSection> {
public:
    static constexpr cls_ClassInfo Class{"korC_IntegratedOutputSection",
                                         "a section over which forces are summed"};
};

/// A named list of points in time for output requests. Only its name reaches the deck.
class kprC_TimePoint final : public cls_RecordOf<kprC_TimePoint> {
public:
    static constexpr cls_ClassInfo Class{"kprC_TimePoint", "a named list of points in time"};

    bool generate = false;
    cow_2DArray<double> points;

    static const cls_FieldTable& Fields();
};

/// Controls of adaptive meshing; nothing of them reaches the deck.
class kadC_AdptMeshCtrl final : public cls_RecordOf<kadC_AdptMeshCtrl> {
public:
    static constexpr cls_ClassInfo Class{"kadC_AdptMeshCtrl", "controls of adaptive meshing"};

    cow_String description;

    static const cls_FieldTable& Fields();
};

class kprC_AdptMeshConsState final : public cls_RecordOf<kprC_AdptMeshConsState> {
public:
    static constexpr cls_ClassInfo Class{"kprC_AdptMeshConsState", "state of a mesh constraint in one step"};
};

/// A constraint on the motion of the mesh; nothing of it reaches the deck.
class kprC_AdptMeshCons final
    : public cls_RecordOf<kprC_AdptMeshCons, kprC_PropagatingOf<kprC_AdptMeshCons, kprC_AdptMeshConsState>> {
public:
    using BaseRecord = kprC_PropagatingObject;
    static constexpr cls_ClassInfo Class{"kprC_AdptMeshCons", "a constraint on the motion of the mesh"};

    mdl_PropagationFamilyEnm Family() const override { return mdl_PropagationFamilyEnm::LOAD; }
    cls_Record* NewState(unsigned) const override { return new kprC_AdptMeshConsState(); }
};

void cls_RegisterOutputRecords(cls_ClassRegistrar& registrar);

#endif
