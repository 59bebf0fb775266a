#ifndef QRX_STORE_ODIK_MODEL_H
#define QRX_STORE_ODIK_MODEL_H

#include "store_interface/findings/fnd_Finding.h"
#include "store_interface/model/odiK_Assembly.h"
#include "store_interface/model/odiK_Datum.h"
#include "store_interface/model/odiK_Mesh.h"
#include "store_interface/records/amplitudes/kamC_Amplitude.h"
#include "store_interface/records/conditions/kbcC_BC.h"
#include "store_interface/records/conditions/kloC_Load.h"
#include "store_interface/records/conditions/kpfC_Field.h"
#include "store_interface/records/constraints/kcoC_Constraint.h"
#include "store_interface/records/interactions/kinC_Interaction.h"
#include "store_interface/records/materials/kmaC_Material.h"
#include "store_interface/records/output/korC_Output.h"
#include "store_interface/records/part_attributes/ptoC_PartAttribute.h"
#include "store_interface/records/sections/kbpC_BeamProfile.h"
#include "store_interface/records/sections/kseC_ConnectorSection.h"

#include <atomic>
#include <map>
#include <mutex>
#include <optional>

/// An attribute of a part, given on a set of the mesh by name until the instance is known.
struct odiK_AttributeInput {
    cow_String setName;
    mdl_ObjCow<ptoC_PartAttribute> record;
};

/// The attributes of a part or an instance, as given.
struct odiK_AttributeInputs {
    std::vector<odiK_AttributeInput> sectionAssignments;
    std::vector<odiK_AttributeInput> materialOrientations;
    std::vector<odiK_AttributeInput> beamOrientations;
};

struct odiK_Part : cls_RecordOf<odiK_Part> {
    static constexpr cls_ClassInfo Class{"odiK_Part", "A part: a mesh, and attributes on its sets."};

    cow_String name;
    cow_String solverInput;
    cow_CountedHld<odiK_Mesh> mesh; // null: none
    odiK_AttributeInputs attributes;

    static const cls_FieldTable& Fields();
};

/// An entry of the assembly. What it doesn't have of its own it takes from its part.
struct odiK_Instance : cls_RecordOf<odiK_Instance> {
    static constexpr cls_ClassInfo Class{
        "odiK_Instance", "An instance of a part. What it gives of its own takes the place of the part's."};
    using OwnInputs = std::optional<std::vector<odiK_AttributeInput>>;

    cow_String name;
    cow_String partName;
    cow_CountedHld<odiK_Part> part; // null for an entry that is no part instance and names none
    bool isPartInstance = true;
    /// Single precision; the rotation vector's direction is the axis through the origin, its length the angle
    /// in radians; it is applied before the translation.
    float translation[3] = {0.0F, 0.0F, 0.0F};
    float rotation[3] = {0.0F, 0.0F, 0.0F};
    cow_String solverInput;
    cow_CountedHld<odiK_Mesh> ownMesh; // null: the part's
    OwnInputs ownSectionAssignments;
    OwnInputs ownMaterialOrientations;
    OwnInputs ownBeamOrientations;

    /// 1, 2, ... in ascending order of the names; negative for entries that are no part instances. Known when
    /// the instances are sealed.
    int meshIndex = 0;
    /// The attributes with their regions; filled when the model is completed.
    odiK_PartInstance attributes;

    /// The mesh that it shows; null when there is none at all.
    cow_CountedHld<odiK_Mesh> Mesh() const {
        return !ownMesh.IsNull() || part.IsNull() ? ownMesh : part->mesh;
    }

    static const cls_FieldTable& Fields();
};

/// One entry of a set of the assembly: members in the mesh of an instance, or in the assembly's own mesh when
/// the name is empty.
struct odiK_MemberInput {
    cow_String instanceName;
    std::span<const int> labels;
    std::span<const odiK_FacetInput> facets;
};

/// A kind of finding that is known and meant to be as it is.
class odiK_IgnoredFinding final : public cls_RecordOf<odiK_IgnoredFinding> {
public:
    static constexpr cls_ClassInfo Class{"odiK_IgnoredFinding",
                                         "a kind of finding that is known, and not to be told"};

    cow_String code;
    cow_String reason;
    /// JSON pointer into the model file; empty: wherever it is found.
    cow_String place;

    static const cls_FieldTable& Fields();
};

/// The data of a model besides its tree, its steps and its repositories.
struct odiK_ModelData : cls_RecordOf<odiK_ModelData> {
    static constexpr cls_ClassInfo Class{"odiK_ModelData", "A model: all that one deck is written from."};

    cow_String description;
    cow_String topLevelSolverInput;
    cow_String solverInput;
    double absoluteZero = 0.0;
    double stefanBoltzmann = 0.0;
    /// "NOT_SET", "SCATTERED" or "TOTAL".
    cow_String waveFormulation = "NOT_SET";
    cow_String restartJob;
    cow_String restartStep;
    int restartIncrement = 0;
    bool endRestartStep = false;
    cow_String globalJob;
    bool shellToSolid = false;
    /// Unset: EXPLICIT when an analysis step is explicit, else IMPLICIT.
    int analysisProduct = cls_UnsetInt;
    /// Null: none.
    mdl_ObjCow<ddb_ModelSectorDefinition> cyclicSymmetry;
    cow_List<odiK_IgnoredFinding> ignore;

    static const cls_FieldTable& Fields();
};

/// A model in memory: the object behind all views, and the interface through which a program fills a store.
/// Parts first, then instances, then sets, regions and records; the first region or set of the assembly
/// seals the instances. Complete() works out what follows from all that; the store calls it when the model is
/// first read. A model must not change while it is being written.
class odiK_Model : public odiK_ModelData {
public:
    explicit odiK_Model(const cow_String& name) : name_(name) {}
    odiK_Model(const odiK_Model&) = delete;
    odiK_Model& operator=(const odiK_Model&) = delete;

    const cow_String& Name() const { return name_; }
    /// Makes this model, which is empty, a copy of a complete one: it shares parts, instances, meshes, sets,
    /// steps and records with it. Records may then change, repository by repository; all else must not.
    void Share(const odiK_Model& other);
    /// Whether it came from the other by Share(), or the other from it, or both from a third.
    bool SharesWith(const odiK_Model& other) const { return origin_ == other.origin_; }

    // A repository has a row in odiK_Repositories.cpp too.
    kprC_StepContainer steps;
    mdl_MapString2ObjCow<kmaC_Material> materials;
    mdl_MapString2ObjCow<kseC_Section> sections;
    mdl_MapString2ObjCow<kbpC_BeamProfile> beamProfiles;
    mdl_MapString2ObjCow<kamC_Amplitude> amplitudes;
    mdl_MapString2ObjCow<kcoC_Constraint> constraints;
    mdl_MapString2ObjCow<kinC_ContactControls> contactControls;
    mdl_MapString2ObjCow<kinC_ContactInitialization> contactInitializations;
    mdl_MapString2ObjCow<kinC_InteractionProperty> interactionProperties;
    mdl_MapString2ObjCow<kprC_TimePoint> timePoints;
    mdl_MapString2ObjCow<kadC_AdptMeshCtrl> adaptiveMeshControls;
    kprC_PropagatingContainer<kbcC_BC> boundaryConditions;
    kprC_PropagatingContainer<kloC_Load> loads;
    kprC_PropagatingContainer<kpfC_Field> fields;
    kprC_PropagatingContainer<kinC_Interaction> interactions;
    kprC_PropagatingContainer<korC_FieldOutput> fieldOutputRequests;
    kprC_PropagatingContainer<korC_HistoryOutput> historyOutputRequests;
    kprC_PropagatingContainer<kprC_AdptMeshCons> adaptiveMeshConstraints;

    /// Adds a datum under a new name; its id is its place from 1. Axes are normalised; `zAxis` may be zero,
    /// and is then the cross product of the others. A zero length or parallel axes raise.
    dtmC_DatumRef AddDatum(odiK_Datum datum);
    /// The reference of the datum, null when there is none of the name.
    dtmC_DatumRef FindDatum(const cow_String& name) const;
    const std::vector<odiK_Datum>& Datums() const { return datums_; }

    /// Adds an empty part, or entry of the assembly, under a new name; a name that is taken, or a part that
    /// is not there, raises.
    odiK_Part& AddPart(const cow_String& name);
    odiK_Instance& AddInstance(const cow_String& name, const cow_String& partName);
    /// Adds an entry that is no part instance, with a part or without ("").
    odiK_Instance& AddOtherEntry(const cow_String& name, const cow_String& partName);
    /// Adds an entry of either kind, with its name, that of its part and all it has of its own.
    odiK_Instance& AddEntry(odiK_Instance entry);
    const std::map<cow_String, cow_CountedHld<odiK_Part>>& Parts() const { return parts_; }
    const std::map<cow_String, cow_CountedHld<odiK_Instance>>& Instances() const { return instances_; }
    /// The entry, or null.
    odiK_Instance* FindInstance(const cow_String& name) const;
    /// The part instance whose mesh index it is, or null.
    cow_CountedHld<odiK_Instance> InstanceOfMesh(int meshIndex) const;
    /// Gives the instances their mesh indices. No instance can be added later.
    void SealInstances();
    bool InstancesAreSealed() const { return sealed_; }

    /// The assembly's own mesh, made at the first use.
    odiK_Mesh& AssemblyMesh();
    const cow_CountedHld<odiK_Mesh>& ConstAssemblyMesh() const { return assemblyMesh_; }
    odiK_Assembly& AssemblyObject() { return assembly_; }
    const odiK_Assembly& AssemblyObject() const { return assembly_; }
    const std::vector<cow_CountedHld<odiK_Set>>& AssemblySets() const { return assemblySets_; }
    int FindAssemblySet(const cow_String& name) const;
    /// Adds a set of the assembly. Places of problems begin with "/members/<entry>".
    void AddAssemblySet(const cow_String& name, res_SetTypeEnm type, bool internal,
                        std::span<const odiK_MemberInput> members, fnd_Sink& problems);
    void AddAssemblySet(const cow_String& name, res_SetTypeEnm type,
                        std::span<const odiK_MemberInput> members, bool internal = false);

    /// The region of a set of the assembly (`instanceName` empty) or of an instance; without a value when
    /// there is no such set. Seals the instances.
    rgnC_Region FindRegion(const cow_String& instanceName, const cow_String& setName);
    /// That of the set at a place among the sets, which must be there.
    rgnC_Region RegionAt(const cow_String& instanceName, int place);
    /// The same; a set that is not there raises.
    rgnC_Region Region(const cow_String& instanceName, const cow_String& setName);

    /// The region of an internal node set of the assembly with the nodes of all these, each node once.
    /// Without a value where a complete model has no such set.
    rgnC_Region JoinNodeSets(const cow_List<rgnC_Region>& regions);

    /// Works out what follows: attributes of the instances on their own sets, statuses and states in all
    /// steps. Raises when something can't be. Must be called again after a change of a model that has been
    /// read.
    void Complete();
    /// The same, once. Threads that read one model may call it at once.
    void EnsureComplete();
    /// Complete() but for what lives across steps.
    void CompleteTree(fnd_Sink& problems);
    /// Tells that all of it has been worked out.
    void SetComplete() { complete_.store(true, std::memory_order_release); }
    bool IsComplete() const { return complete_.load(std::memory_order_acquire); }

private:
    template <class Entry>
    void CheckNewName(const std::map<cow_String, cow_CountedHld<Entry>>& entries, const cow_String& name,
                      const char* kind) const;

    cow_String name_;
    std::shared_ptr<const char> origin_ = std::make_shared<const char>(); // of all that shares
    std::vector<odiK_Datum> datums_;
    std::unordered_map<std::string_view, int> datumIndex_; // ids; the names lie in the datums
    std::map<cow_String, cow_CountedHld<odiK_Part>> parts_;
    std::map<cow_String, cow_CountedHld<odiK_Instance>> instances_;
    std::vector<cow_CountedHld<odiK_Instance>> instanceOfMesh_;
    bool sealed_ = false;
    std::atomic<bool> complete_ = false;
    std::mutex completing_;
    cow_CountedHld<odiK_Mesh> assemblyMesh_;
    odiK_Assembly assembly_;
    std::vector<cow_CountedHld<odiK_Set>> assemblySets_;
    std::unordered_map<std::string_view, int> assemblySetIndex_;
};

#endif
