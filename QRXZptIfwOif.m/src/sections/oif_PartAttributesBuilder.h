#ifndef QRX_OIF_PARTATTRIBUTESBUILDER_H
#define QRX_OIF_PARTATTRIBUTESBUILDER_H

#include "base/oif_Component.h"
#include "foundation/cow_Map.h"
#include "store_interface/records/part_attributes/bme_ElemCtrlParams.h"
#include "store_interface/records/part_attributes/bme_MapPropertyArray.h"
#include "store_interface/records/part_attributes/ptoC_PartAttribute.h"
#include "store_interface/records/sections/kseC_Section.h"

#include <map>
#include <memory>
#include <set>

class kseC_BeamSection;
class kseC_GasketSection;
class kseC_PointSection;

/// Sections of the instances' elements. The model gives sections, controls and orientations each on a region
/// of its own; the deck has one section for each group of elements with the same combination of them.
class oif_PartAttributesBuilder final : public oif_ComponentOf<oif_PartAttributesBuilder> {
public:
    using oif_ComponentOf::oif_ComponentOf;
    void Build() override;

    static const char* PartSetString() { return "_I"; }
    static const char* RegionString() { return "Region: "; }

private:
    /// What a group's section keywords refer to.
    struct Group {
        cow_String sectionName;
        cow_String setName;
        int beamOriIndex = -1;
        cow_String orientationName;
        cow_String controlsName;
        bme_ElemCtrlParams controls;
        double offset = 0.0;
    };

    void InitializePropertyArray(const ddb_PartInstance& instance);
    void SetSectionsInArray(const ddb_PartInstance& instance);
    void SetElemCtrlInArray(const ddb_PartInstance& instance);
    void SetBeamOriInArray(const ddb_PartInstance& instance);
    void SetMatOriInArray(const ddb_PartInstance& instance);
    void ProcessPropertyArray(const ddb_PartInstance& instance);
    /// Whether a group is a part only of what its section assignment names.
    bool IsPartial(const bme_MapPropertyArray& groups, int key) const;
    cow_String GroupSetName(const rgnC_Region& region, int key, bool isPartial) const;
    /// Of the material orientation with this number.
    cow_String OrientationName(const ddb_PartInstance& instance, int index) const;
    void CreateSetsAndAttributes(const ddb_PartInstance& instance,
                                 const std::shared_ptr<const bme_MapPropertyArray>& groups);
    void CreateElementControls();

    struct SectionRow;
    /// Null for a class whose sections are none of elements of instances.
    static const SectionRow* FindSectionRow(unsigned typeId);

    void CreateSection(const ddb_PartInstance& instance, const Group& group);
    void CreateSolidSection(const ddb_PartInstance& instance, const kseC_Section& section,
                            const Group& group);
    void CreateShellSection(const ddb_PartInstance& instance, const kseC_Section& section,
                            const Group& group);
    void CreateShellGeneralSection(const ddb_PartInstance& instance, const kseC_Section& section,
                                   const Group& group);
    void CreateBeamSection(const ddb_PartInstance& instance, const kseC_BeamSection& beam,
                           const Group& group);
    void CreateTrussSection(const ddb_PartInstance& instance, const kseC_Section& section,
                            const Group& group);
    void CreateMembraneSection(const ddb_PartInstance& instance, const kseC_Section& section,
                               const Group& group);
    void CreateGasketSection(const ddb_PartInstance& instance, const kseC_GasketSection& gasket,
                             const Group& group);
    void CreatePointSection(const ddb_PartInstance& instance, const kseC_PointSection& point,
                            const Group& group);
    /// What stands behind the section of a shell.
    void AddShellStiffness(const ddb_PartInstance& instance, const kseC_Section& section, const Group& group);
    void CreateMaterialOrientation(const ddb_PartInstance& instance,
                                   const ptoC_MaterialOrientation& orientation, const cow_String& name);

    /// Sets an index of the properties of all elements in the region; gives the number of its labels.
    int Stamp(const ddb_PartInstance& instance, const rgnC_Region& region, int bme_Property::*index,
              int value);
    void AddHourglassStiffness(const ddb_PartInstance& instance, const Group& group);
    bme_ElemLibrary ElemLibrary() const;
    bool IsStandard() const { return ElemLibrary() == bme_ElemLibrary::STANDARD; }

    // Distinct controls other than the defaults, over all instances, so that equal ones share a name.
    cow_Map<int, bme_ElemCtrlParams> elemCtrlMap_;
    int nextElemCtrlKey_ = 0;
    // Of the instance at hand, its elements in the order of the mesh.
    std::shared_ptr<bme_PropertyArray> properties_;
    std::set<cow_String> writtenOrientations_;
    /// Labels that each section assignment names, also those that later assignments take over.
    std::map<int, int> assignmentSize_;
};

#endif
