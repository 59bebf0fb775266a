#ifndef QRX_VPG_LAYOUT_H
#define QRX_VPG_LAYOUT_H

#include "store_interface/model/odb_Odb.h"
#include "view_page/vpg_Arrays.h"
#include "view_page/vpg_Sets.h"

#include <map>
#include <memory>

/// What stands in a model and where: the meshes that a page draws, who shows them in which place, and the
/// sets. A mesh that several instances share stands once.
class vpg_Layout {
public:
    /// An instance; or the assembly itself, with its own mesh; or, of a model without instances, a part.
    struct Shown {
        std::string name;
        std::string part;
        const char* kind = "instance";
        std::size_t mesh = 0;
        gsl_Matrix placement;
        const odiK_PartInstance* attributes = nullptr;
        const odiK_Instance* instance = nullptr;
    };

    explicit vpg_Layout(const odb_Odb& odb, const cow_String& modelName);
    vpg_Layout(const vpg_Layout&) = delete;
    vpg_Layout& operator=(const vpg_Layout&) = delete;

    const odiK_Model& Model() const { return model_; }
    const std::vector<Shown>& All() const { return shown_; }
    const vpg_Mesh& MeshOf(const Shown& shown) const { return *meshes_[shown.mesh].mesh; }
    /// The place of an instance among all that is shown, -1 for none.
    int PlaceOf(const cow_String& instanceName) const;

    /// The section of each element, by its place among all sections, -1 for none.
    std::vector<std::int16_t> SectionsOfElements(const Shown& shown) const;

    /// "meshes", "instances", "sets" (the assembly's) and "sections" of the page's header.
    void Describe(nlohmann::ordered_json& header, vpg_Arrays& arrays);
    /// {"instance", "set"}: places among all that is shown, or -1 for the assembly, and among its sets. Null
    /// for a region that the page can't show.
    nlohmann::ordered_json RegionOf(const rgnC_Region& region) const;

private:
    struct Entry {
        cow_CountedHld<odiK_Mesh> handle;
        std::unique_ptr<vpg_Mesh> mesh;
        std::vector<vpg_SetPart> sets;
        /// Places on the page of the mesh's nodes, -1 for none.
        std::vector<int> pageNodes;
        std::vector<char> shown;
    };
    struct AssemblySet {
        std::size_t shown;
        vpg_SetPart part;
    };

    std::size_t EntryOf(const cow_CountedHld<odiK_Mesh>& mesh, std::vector<float> foreign = {});
    void AddInstances();
    void AddAssembly();
    void AddPartsAlone();
    std::vector<float> ForeignNodes(const odiK_Mesh& mesh) const;
    void ResolveSets();
    void ChooseNodes();
    static void ShowNodes(Entry& entry, const std::vector<int>& nodes);

    nlohmann::ordered_json MeshText(Entry& entry, vpg_Arrays& arrays) const;
    nlohmann::ordered_json BlockText(const Entry& entry, const vpg_Block& block, vpg_Arrays& arrays) const;
    nlohmann::ordered_json InstanceText(const Shown& shown, vpg_Arrays& arrays);
    nlohmann::ordered_json PartText(const Entry& entry, const vpg_SetPart& part, vpg_Arrays& arrays) const;
    nlohmann::ordered_json AssemblySetsText(vpg_Arrays& arrays) const;
    nlohmann::ordered_json SectionsText() const;
    std::vector<int> SectionsOfCells(const Shown& shown) const;
    nlohmann::ordered_json OrientationsOf(const ptoC_PartAttributeList& list) const;

    const odiK_Model& model_;
    std::vector<Entry> meshes_;
    std::map<const odiK_Mesh*, std::size_t> placeOfMesh_;
    std::vector<Shown> shown_;
    std::map<cow_String, int> placeOfInstance_;
    /// By mesh index: what is shown.
    std::map<int, std::size_t> ofMeshIndex_;
    std::vector<std::vector<AssemblySet>> assemblySets_;
    std::map<std::pair<const void*, std::size_t>, int> sectionArrays_;
};

#endif
