#ifndef QRX_STORE_KORC_OUTPUT_H
#define QRX_STORE_KORC_OUTPUT_H

#include "store_interface/propagation/kprC_PropagatingObject.h"
#include "store_interface/records/output/korC_OdbRequest.h"
#include "store_interface/regions/rgnC_Region.h"

/// What an output request asks for in one step: variables, and how often.
class korC_OutputState : public cls_AbstractRecordOf<korC_OutputState> {
public:
    static constexpr cls_ClassInfo Class{"korC_OutputState", "what an output request asks for in one step"};

    mdl_PropAttr<int> frequency;
    mdl_PropAttr<int> numberInterval;
    mdl_PropAttr<double> timeInterval;
    mdl_PropAttr<cls_xpListInt> modeList;
    mdl_PropAttr<bool> timeMarks;
    mdl_PropAttr<cow_String> timePoints;
    mdl_PropAttr<korC_TypeEnm> frequencyType;
    mdl_PropAttr<korC_VariablesTypeEnm> variablesType;
    mdl_PropAttr<cls_xpListString> variables;

    virtual korC_OdbChannel::TypeEnm Channel() const = 0;
    /// Fits the variables to the procedure and the channel: drops what they don't know and names that stand
    /// there already; a component that fields can't hold gives way to its variable.
    void ReconstructVariables(unsigned stepType);
    /// Turns the one word PRESELECT or ALL into the type of variables. With `compare`, also a list that holds
    /// just the variables of one of them.
    void ConvertVariablesToVariablesSymbol(unsigned stepType, bool compare);

    static const cls_FieldTable& Fields();

protected:
    /// What a procedure gives without being asked.
    korC_OutputState(unsigned stepType, bool isField);
};

class korC_FieldOutputState final : public cls_RecordOf<korC_FieldOutputState, korC_OutputState> {
public:
    static constexpr cls_ClassInfo Class{"korC_FieldOutputState", "state of a field output request"};
    /// As for a general static step.
    korC_FieldOutputState();
    explicit korC_FieldOutputState(unsigned stepType) : cls_RecordOf(stepType, true) {}
    korC_OdbChannel::TypeEnm Channel() const override { return korC_OdbChannel::TypeEnm::FIELD; }
};

class korC_HistoryOutputState final : public cls_RecordOf<korC_HistoryOutputState, korC_OutputState> {
public:
    static constexpr cls_ClassInfo Class{"korC_HistoryOutputState", "state of a history output request"};
    /// As for a general static step.
    korC_HistoryOutputState();
    explicit korC_HistoryOutputState(unsigned stepType) : cls_RecordOf(stepType, false) {}
    korC_OdbChannel::TypeEnm Channel() const override { return korC_OdbChannel::TypeEnm::HISTORY; }
};

/// From where in the model results are wanted; held by name.
class korC_Output : public kprC_PropagatingOf<korC_Output, korC_OutputState> {
public:
    static constexpr cls_ClassInfo Class{"korC_Output", "an output request"};

    rgnC_Region region;
    cow_String boltLoad;
    cls_xpListInt sectionPoints;
    cls_xpListString interactions;
    korC_RebarEnm rebar = korC_RebarEnm::EXCLUDE;
    cow_String filter;
    int layupLocation = 0;

    mdl_PropagationFamilyEnm Family() const override { return mdl_PropagationFamilyEnm::OUTPUT_REQUEST; }
    /// Status 1, 2, 3, 4, 8, 9, 10, 11 or 14.
    bool HasStep(const cow_String& stepName) const;
    const korC_OutputState& ConstGetState(const cow_String& stepName) const {
        return ConstGetStateQuad(stepName).state.ConstGet();
    }
    /// What the request is about.
    virtual korC_DomainTypeEnm DomainType() const;

    static const cls_FieldTable& Fields();
};

/// Results over a region at a few moments.
class korC_FieldOutput : public cls_RecordOf<korC_FieldOutput, korC_Output> {
public:
    static constexpr cls_ClassInfo Class{"korC_FieldOutput", "a request for field output"};

    bool directions = true;

    cls_Record* NewState(unsigned procedureType) const override;

    static const cls_FieldTable& Fields();
};

/// Results at a few points, or of the whole model, at many moments.
class korC_HistoryOutput : public cls_RecordOf<korC_HistoryOutput, korC_Output> {
public:
    static constexpr cls_ClassInfo Class{"korC_HistoryOutput", "a request for history output"};

    cow_String section;
    cls_xpListString springs;
    int sensor = 0;

    cls_Record* NewState(unsigned procedureType) const override;
    korC_DomainTypeEnm DomainType() const override;

    static const cls_FieldTable& Fields();
};

/// A named section over which forces are summed.
class korC_IntegratedOutputSection final : public cls_RecordOf<korC_IntegratedOutputSection> {
public:
    static constexpr cls_ClassInfo Class{"korC_IntegratedOutputSection",
                                         "a section over which forces are summed"};

    rgnC_Region surface;
    dtmC_DatumRef orientation;
    rgnC_Region refNode;
    cow_String description;

    static const cls_FieldTable& Fields();
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
