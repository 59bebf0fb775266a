#ifndef QRX_OIF_MODELINFO_H
#define QRX_OIF_MODELINFO_H

#include "base/oif_Model.h"
#include "foundation/cow_Map.h"
#include "foundation/omi_IntTable.h"
#include "keyword_layer/qkw_ModelInfo.h"

#include <map>

/// The run information over the store. The constructor reads the meshes and steps; only the label counters
/// change later. Labels are handed out per instance ("" is the assembly's own mesh), beginning behind the
/// number of its nodes or elements.
class oif_ModelInfo : public qkw_ModelInfo {
public:
    explicit oif_ModelInfo(const ddb_Model& model);

    bool V6Format() const override { return v6Format_; }
    int AssyElementOffsets(const cow_String& instance) const override;
    int AssyNodeOffsets(const cow_String& instance) const override;
    int GetNewNodeIndex(const cow_String& instance, bool commit) override;
    int IncrementNodeIndex(const cow_String& instance, int count) override;
    int GetNewElementIndex(const cow_String& instance, bool commit) override;
    int IncrementElementIndex(const cow_String& instance, int count) override;
    cow_String InstanceName(int meshIndex) const override;
    cow_String GetOrientationName(const dtmC_DatumRef& datum, double angle, cow_String suffix) const override;
    kprC_AnalysisProductEnm AnalysisProduct() const override;
    int TeachingNodes() const override { return nodes_.total; }
    /// Whether a step behind the first is explicit.
    virtual bool ExplicitJob() const { return explicitJob_; }

    const oif_Model& Model() const { return static_cast<const oif_Model&>(qkw_ModelInfo::Model()); }

protected:
    /// The other format; decks are never written in it.
    void SetV6Format(bool v6Format) { v6Format_ = v6Format; }

private:
    // The numbering of nodes, or of elements.
    struct Numbering {
        std::map<cow_String, int> last; // the highest label given so far, by instance
        int total = 0;
        int extra = 0;

        void Enter(const cow_String& instance, int count);
        /// An unknown instance raises.
        int& Last(const cow_String& instance);
        /// Each instance counts from 0.
        int Offset(const cow_String& instance) const;
        int GetNew(const cow_String& instance, bool commit, bool v6Format);
        int Increment(const cow_String& instance, int count, bool v6Format);
    };

    void SetQIFSolverVersion() { v6Format_ = true; }
    void SetMeshData();
    void SetStepData();
    void EnterMesh(const cow_String& instance, const ddb_Mesh& mesh);

    ddb_Model model_;
    bool v6Format_ = false;
    Numbering elements_;
    Numbering nodes_;
    bool explicitJob_ = false;
    cow_CountedHld<omi_IntTable<cow_String>> meshNames_;
};

#endif
