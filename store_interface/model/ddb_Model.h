#ifndef QRX_STORE_DDB_MODEL_H
#define QRX_STORE_DDB_MODEL_H

#include "store_interface/model/ddb_Assembly.h"
#include "store_interface/model/ddb_Datum.h"
#include "store_interface/propagation/kprC_PropagatingObject.h"

class ddb_ModelSectorDefinition;
class kadC_AdptMeshCtrl;
class kamC_Amplitude;
class kbcC_BC;
class kbpC_BeamProfile;
class kcoC_Constraint;
class kinC_ContactControls;
class kinC_ContactInitialization;
class kinC_Interaction;
class kinC_InteractionProperty;
class kloC_Load;
class kmaC_Material;
class korC_FieldOutput;
class korC_HistoryOutput;
class kpfC_Field;
class kprC_AdptMeshCons;
class kprC_TimePoint;

/// A container object of the model; container() gives what it holds.
template <class Container>
class ddb_Container {
public:
    ddb_Container(const cow_CountedHld<odiK_Model>& model, const Container& container)
        : model_(model), container_(&container) {}
    const Container& container() const { return *container_; }

private:
    cow_CountedHld<odiK_Model> model_;
    const Container* container_;
};

/// View on one step.
class ddb_DdbStep {
public:
    explicit ddb_DdbStep(const kprC_Step& step) : step_(&step) {}
    bool isExplicit() const { return step_->Explicit(); }

private:
    const kprC_Step* step_;
};

class ddb_DdbStepIT {
public:
    explicit ddb_DdbStepIT(const kprC_StepContainer& steps) : steps_(&steps) {}
    void first() { index_ = 0; }
    void next() { ++index_; }
    bool isDone() const { return index_ >= steps_->Size(); }
    const cow_String& currentKey() const { return steps_->NameAt(index_); }
    ddb_DdbStep currentValue() const { return ddb_DdbStep(steps_->StepAt(index_)); }

private:
    const kprC_StepContainer* steps_;
    int index_ = 0;
};

/// The steps of the model.
class ddb_DdbStepContainer : public ddb_Container<kprC_StepContainer> {
public:
    explicit ddb_DdbStepContainer(const cow_CountedHld<odiK_Model>& model);
    int size() const { return container().Size(); }
    /// The model's own when it is set; else EXPLICIT when a step behind the first is explicit, else IMPLICIT.
    kprC_AnalysisProductEnm AnalysisProduct() const {
        return AnalysisProductOf(container(), analysisProduct_);
    }
    static kprC_AnalysisProductEnm AnalysisProductOf(const kprC_StepContainer& steps, int analysisProduct);
    ddb_DdbStepIT createIterator() const { return ddb_DdbStepIT(container()); }

private:
    int analysisProduct_;
};

/// What the model's shortcut leads to: the attributes that are held apart from the tree.
class ddr_Model {
public:
    explicit ddr_Model(const odiK_Model& model) : model_(&model) {}
    /// The sections, as a repository; a mdl_MapString2ObjCow<kseC_Section>.
    const mdl_Repository& ConstGetSections() const;

private:
    const odiK_Model* model_;
};

/// View on a model: the entry to everything in it.
class ddb_Model {
public:
    explicit ddb_Model(const cow_CountedHld<odiK_Model>& model);

    ddb_Assembly rootAssembly() const { return ddb_Assembly(model_); }
    ddb_PartContainer part() const { return ddb_PartContainer(model_); }
    ddb_DdbStepContainer step() const { return ddb_DdbStepContainer(model_); }
    /// The mesh of an index: 0 the assembly's, else a part instance's. Another index raises.
    ddb_Mesh mesh(int meshIndex) const;
    /// The datum of an id from 1; another id raises.
    ddb_Datum datum(const int& id) const;
    /// The object of the model under a key; there is one, under "rootAssembly". Another key raises.
    const odiK_Assembly& Object(const cow_String& key) const;
    /// Leads to the model's attributes. Must not outlive this view.
    ddr_ShortcutTo<ddr_Model> Shortcut() const;

    const cow_String& solverInput() const;
    const cow_String& topLevelSolverInput() const;
    double absoluteZero() const;
    double stefanBoltzmann() const;
    const cow_String& waveFormulation() const;
    const cow_String& restartJob() const;
    const cow_String& restartStep() const;
    int restartIncrement() const;
    bool endRestartStep() const;
    const cow_String& globalJob() const;
    bool shellToSolid() const;
    /// Whether the constraint of the name joins the two sides of the cyclic sector; false for an unknown
    /// name.
    bool hasCyclicSymmetry(const cow_String& constraintName) const;
    /// The sector definition; one without symmetry when the model has none.
    const ddb_ModelSectorDefinition& modelSectorForCyclicSymmetry() const;

    ddr_ShortcutTo<mdl_MapString2ObjCow<kmaC_Material>> material() const;
    ddr_ShortcutTo<mdl_MapString2ObjCow<kamC_Amplitude>> amplitudes() const;
    ddr_ShortcutTo<mdl_MapString2ObjCow<kbpC_BeamProfile>> beamProfile() const;

    template <class T>
    using Named = ddb_Container<mdl_MapString2ObjCow<T>>;
    template <class T>
    using Propagating = ddb_Container<kprC_PropagatingContainer<T>>;
    Named<kcoC_Constraint> constraints() const;
    Named<kinC_ContactControls> contactControls() const;
    Named<kinC_ContactInitialization> contactInitializations() const;
    Named<kinC_InteractionProperty> interactionProperties() const;
    Named<kprC_TimePoint> timePoints() const;
    Named<kadC_AdptMeshCtrl> adaptiveMeshControls() const;
    Propagating<kbcC_BC> boundaryConditions() const;
    Propagating<kloC_Load> loads() const;
    Propagating<kpfC_Field> fields() const;
    Propagating<kinC_Interaction> interactions() const;
    Propagating<korC_FieldOutput> fieldOutputRequests() const;
    Propagating<korC_HistoryOutput> historyOutputRequests() const;
    Propagating<kprC_AdptMeshCons> adaptiveMeshConstraints() const;

private:
    cow_CountedHld<odiK_Model> model_;
    ddr_Model attributes_;
};

#endif
