#ifndef QRX_KEYWORD_QKW_MODELINFO_H
#define QRX_KEYWORD_QKW_MODELINFO_H

#include "keyword_layer/qkw_Model.h"

/// A job that a deck is written for; no program of this library makes one.
class qkw_Job {
public:
    virtual ~qkw_Job() = default;
};

/// A region of the modelling kernel, which a store without one never gives.
class rgnK_Region;
/// Assembly data and substructures of the modelling kernel.
class qkw_KernelAssembly;
class qkw_SubstructureElements;

/// The state that all components of one run share: the model view, the label counters of every mesh and the
/// names of instances by mesh index. Only the counters change during a run, and only upwards.
class qkw_ModelInfo : public mem_AllocationOperators {
public:
    virtual ~qkw_ModelInfo() = default;
    /// Null: there is no job object.
    virtual const qkw_Job* Job() const { return nullptr; }
    virtual const qkw_KernelAssembly* Assy() const { return nullptr; }
    virtual bool V6Format() const = 0;
    virtual bool UseNodeLabels(const cow_String&) const { return true; }
    virtual bool UseElemLabels(const cow_String&) const { return true; }
    /// Offsets of an instance's labels in the numbering of the assembly; "" is the assembly's own mesh. An
    /// unknown instance raises.
    virtual int AssyElementOffsets(const cow_String& instance) const = 0;
    virtual int AssyNodeOffsets(const cow_String& instance) const = 0;
    /// The next free label of the instance; `commit` takes it. An unknown instance raises.
    virtual int GetNewNodeIndex(const cow_String& instance, bool commit) = 0;
    /// Takes `count` labels and gives the last of them.
    virtual int IncrementNodeIndex(const cow_String& instance, int count) = 0;
    virtual int GetNewElementIndex(const cow_String& instance, bool commit) = 0;
    virtual int IncrementElementIndex(const cow_String& instance, int count) = 0;
    /// The instance of a mesh index; "" for the assembly and for an index that is not there.
    virtual cow_String InstanceName(int meshIndex) const = 0;
    /// The name of a datum as one word of the deck. A suffix that is not empty is appended between
    /// underscores if the angle is not exactly 0.
    virtual cow_String GetOrientationName(const dtmC_DatumRef& datum, double angle,
                                          cow_String suffix) const = 0;
    virtual kprC_AnalysisProductEnm AnalysisProduct() const = 0;
    /// Number of nodes in all meshes.
    virtual int TeachingNodes() const = 0;
    virtual void DeleteCache() {}
    virtual bool AttachmentDataFromInstance(int) const { return false; }
    virtual bool AttachmentDataFromRegion(const rgnK_Region&) const { return false; }
    virtual bool VertexSurfacePairsFromInstance(int) const { return false; }
    virtual const qkw_SubstructureElements* SubstructureElems() const { return nullptr; }
    virtual bool IsSubstructureInstance(int) const { return false; }

    const qkw_Model& Model() const { return model_.ConstGet(); }
    int AssyElementOffsetsID(int meshIndex) const { return AssyElementOffsets(InstanceName(meshIndex)); }
    int AssyNodeOffsetsID(int meshIndex) const { return AssyNodeOffsets(InstanceName(meshIndex)); }
    /// Endings of the names of generated points.
    static const char* RefPtSuffix() { return "-RefPt_"; }
    static const char* AttachmentPtSuffix() { return "-AttPt_"; }

    qkw_ModelInfo(const qkw_ModelInfo&) = delete;
    qkw_ModelInfo& operator=(const qkw_ModelInfo&) = delete;

protected:
    qkw_ModelInfo() = default;
    void SetModel(qkw_Model* model) { model_.Reset(model); }

private:
    cow_COW<qkw_Model, cow_Virtual<qkw_Model>> model_;
};

#endif
