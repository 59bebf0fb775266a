#include "sections/oif_PartAttributesBuilder.h"

#include "base/oif_ClassRows.h"
#include "base/oif_Comment.h"
#include "keyword_layer/qkw_QuorixName.h"
#include "materials/oif_Material.h"
#include "mesh/oif_Set.h"
#include "mesh/oif_SetName.h"
#include "sections/oif_BeamSections.h"
#include "sections/oif_ElementControls.h"
#include "sections/oif_Orientation.h"
#include "sections/oif_PointInertia.h"
#include "sections/oif_ShellSections.h"
#include "sections/oif_SolidSections.h"
#include "store_interface/model/odiK_Assembly.h"
#include "store_interface/model/odiK_Mesh.h"
#include "store_interface/records/sections/kbpC_BeamProfile.h"
#include "store_interface/records/sections/kseC_BeamSection.h"
#include "store_interface/records/sections/kseC_PointSection.h"
#include "store_interface/records/sections/kseC_ShellSections.h"
#include "store_interface/records/sections/kseC_SolidSections.h"

#include <vector>

namespace {

/// The region's set as comments name it.
cow_String NameInComment(const rgnC_Region& region) {
    return region.ConstSet().Data().Internal() ? cow_String("Picked") : region.SetName();
}

/// The labels of the elements of a group.
class GroupLabels final : public oif_LabelSource {
public:
    GroupLabels(const ddb_Mesh& mesh, std::shared_ptr<const bme_MapPropertyArray> groups, int key)
        : mesh_(mesh), groups_(std::move(groups)), key_(key) {}

    void ForEachPiece(const Take& take) const override {
        oif_LabelPieces pieces(take);
        auto elements = mesh_.mesh().Classes().begin();
        groups_->ForEachRun(key_, [&](int first, int count) {
            while (count > 0) {
                while (first >= elements->firstElementIndex + elements->NumElements()) ++elements;
                const int place = first - elements->firstElementIndex;
                const int taken = std::min(count, elements->NumElements() - place);
                pieces.Add({elements->labels.data() + place, static_cast<std::size_t>(taken)});
                first += taken;
                count -= taken;
            }
        });
        pieces.HandOn();
    }

private:
    ddb_Mesh mesh_;
    std::shared_ptr<const bme_MapPropertyArray> groups_;
    int key_;
};

} // namespace

/// How the sections of a class are made.
struct oif_PartAttributesBuilder::SectionRow {
    unsigned typeId;
    /// Beams name their profile in the comment too, and write it themselves.
    bool writesComment = true;
    void (*create)(oif_PartAttributesBuilder& builder, const ddb_PartInstance& instance,
                   const kseC_Section& section, const Group& group);

    template <class R, auto Create>
    static constexpr SectionRow Of(bool writesComment = true) {
        return {R::Class.Id(), writesComment,
                [](oif_PartAttributesBuilder& builder, const ddb_PartInstance& instance,
                   const kseC_Section& section, const Group& group) {
                    (builder.*Create)(instance, static_cast<const R&>(section), group);
                }};
    }
};

const oif_PartAttributesBuilder::SectionRow* oif_PartAttributesBuilder::FindSectionRow(unsigned typeId) {
    using B = oif_PartAttributesBuilder;
    static constexpr SectionRow rows[] = {
        SectionRow::Of<kseC_HomogenousSolidSection, &B::CreateSolidSection>(),
        SectionRow::Of<kseC_CompositeSolidSection, &B::CreateSolidSection>(),
        SectionRow::Of<kseC_HomogenousShellSection, &B::CreateShellSection>(),
        SectionRow::Of<kseC_CompositeShellSection, &B::CreateShellSection>(),
        SectionRow::Of<kseC_GeneralShellSection, &B::CreateShellSection>(),
        SectionRow::Of<kseC_UserShellSection, &B::CreateShellGeneralSection>(),
        SectionRow::Of<kseC_BeamSection, &B::CreateBeamSection>(false),
        SectionRow::Of<kseC_TrussSection, &B::CreateTrussSection>(),
        SectionRow::Of<kseC_MembraneSection, &B::CreateMembraneSection>(),
        SectionRow::Of<kseC_GasketSection, &B::CreateGasketSection>(),
        SectionRow::Of<kseC_PointSection, &B::CreatePointSection>(),
    };
    return oif_FindRow(rows, typeId);
}

void oif_PartAttributesBuilder::Build() {
    ForEachPartInstance([&](const cow_String& name, const ddb_PartInstance& instance) {
        const nex_Context context("instance", name);
        InitializePropertyArray(instance);
        SetSectionsInArray(instance);
        SetElemCtrlInArray(instance);
        SetBeamOriInArray(instance);
        SetMatOriInArray(instance);
        ProcessPropertyArray(instance);
    });
    CreateElementControls();
}

void oif_PartAttributesBuilder::InitializePropertyArray(const ddb_PartInstance& instance) {
    properties_ = std::make_shared<bme_PropertyArray>(instance.elementData().numElements());
}

int oif_PartAttributesBuilder::Stamp(const ddb_PartInstance& instance, const rgnC_Region& region,
                                     int bme_Property::*index, int value) {
    const oif_Set set(region.ConstSet().Data(), instance);
    const odiK_Mesh& mesh = instance.mesh().mesh();
    std::size_t numLabels = 0;
    int first = 0;
    int count = 0;
    set.Labels().ForEachPiece([&](std::span<const int> labels) {
        numLabels += labels.size();
        if (properties_->NumElements() == 0) return;
        for (const int label : labels) {
            // A label that the mesh doesn't have falls on the first element.
            const int place = std::max(mesh.FindElementIndex(label), 0);
            if (place != first + count) {
                properties_->Set(first, count, index, value);
                first = place;
                count = 0;
            }
            ++count;
        }
    });
    properties_->Set(first, count, index, value);
    return static_cast<int>(numLabels);
}

void oif_PartAttributesBuilder::SetSectionsInArray(const ddb_PartInstance& instance) {
    assignmentSize_.clear();
    const ptoC_PartAttributeList& assignments = instance.Shortcut().ConstGet().ConstGetSectionAssignment();
    for (int i = 0; i < assignments.Size(); ++i) {
        const auto& assignment =
            nex_canDynamicCastRef<ptoC_SectionAssignment>(assignments.ConstGet(i), NEX_HERE);
        assignmentSize_[i] = Stamp(instance, assignment.RegionRef(), &bme_Property::SectionIndex, i);
    }
}

void oif_PartAttributesBuilder::SetElemCtrlInArray(const ddb_PartInstance& instance) {
    const bme_ElementData elements(instance.mesh().mesh());
    for (unsigned i = 0; i < elements.NumClasses(); ++i) {
        const bme_ElementClass elementClass = elements.GetClass(i);
        const bme_ElemCtrlParams& controls = elementClass.GetElemControlParams();
        if (controls.IsDefault(ElemLibrary())) continue;
        int key = 0;
        while (key < nextElemCtrlKey_ && elemCtrlMap_.ConstGet(key) != controls) ++key;
        if (key == nextElemCtrlKey_) elemCtrlMap_.Insert(nextElemCtrlKey_++, controls);
        properties_->Set(elementClass.FirstElementIndex(), elementClass.NumElements(),
                         &bme_Property::ElemCtrlIndex, key);
    }
}

void oif_PartAttributesBuilder::SetBeamOriInArray(const ddb_PartInstance& instance) {
    const ddb_BeamOrientationContainer orientations = instance.beamOrientations();
    for (int i = 0; i < orientations.size(); ++i) {
        Stamp(instance, orientations.get(i).region().Region(), &bme_Property::BeamOriIndex, i);
    }
}

void oif_PartAttributesBuilder::SetMatOriInArray(const ddb_PartInstance& instance) {
    const ddb_MaterialOrientationContainer orientations = instance.materialOrientations();
    for (int i = 0; i < orientations.size(); ++i) {
        Stamp(instance, orientations.get(i).region().Region(), &bme_Property::MatOriIndex, i);
    }
}

void oif_PartAttributesBuilder::ProcessPropertyArray(const ddb_PartInstance& instance) {
    if (properties_->NumElements() > 0) {
        const auto groups = std::make_shared<bme_MapPropertyArray>(*properties_);
        std::vector<bool> partial;
        partial.reserve(static_cast<std::size_t>(groups->Count()));
        for (int key = 0; key < groups->Count(); ++key) partial.push_back(IsPartial(*groups, key));
        groups->KeepElements(*properties_, partial);
        properties_.reset();
        CreateSetsAndAttributes(instance, groups);
    }
    properties_.reset();
}

bool oif_PartAttributesBuilder::IsPartial(const bme_MapPropertyArray& groups, int key) const {
    const int section = groups.SectionIndex(key);
    return section != -1 && groups.NumElements(key) != assignmentSize_.at(section);
}

cow_String oif_PartAttributesBuilder::GroupSetName(const rgnC_Region& region, int key, bool isPartial) const {
    oif_SetName name(region, ModelInfo());
    constexpr auto context = oif_SetName::regionContext::INSTANCE;
    return oif_SetName::QuoteIfNeeded(
        isPartial ? name.UniqueSetName(region.SetName() + PartSetString() + cow_String(key + 1), context)
                  : name.UniqueSetName(context));
}

cow_String oif_PartAttributesBuilder::OrientationName(const ddb_PartInstance& instance, int index) const {
    cow_String name = cow_String("Ori-") + cow_String(index + 1);
    if (ModelInfo().V6Format()) return name;
    return qkw_QuorixName(instance.name(), false).Printable() + "_" + name;
}

void oif_PartAttributesBuilder::CreateSetsAndAttributes(
    const ddb_PartInstance& instance, const std::shared_ptr<const bme_MapPropertyArray>& made) {
    const bme_MapPropertyArray& groups = *made;
    writtenOrientations_ = {};
    const ptoC_PartAttributeList& assignments = instance.Shortcut().ConstGet().ConstGetSectionAssignment();
    for (int key = 0; key < groups.Count(); ++key) {
        // Elements without a section have no keyword, but their group uses up a number.
        if (groups.SectionIndex(key) == -1) continue;
        const auto& assignment = nex_canDynamicCastRef<ptoC_SectionAssignment>(
            assignments.ConstGet(groups.SectionIndex(key)), NEX_HERE);
        const bool isPartial = IsPartial(groups, key);

        Group group;
        group.sectionName = assignment.SectionName();
        group.offset = assignment.Offset();
        group.setName = GroupSetName(assignment.RegionRef(), key, isPartial);

        cow_String text = cow_String(RegionString()) + "(" + assignment.SectionName() + ":" +
                          NameInComment(assignment.RegionRef()) + ")";
        const int controlsIndex = groups.ElemCtrlIndex(key);
        if (controlsIndex != -1) {
            group.controls = elemCtrlMap_.ConstGet(controlsIndex);
            group.controlsName = cow_String("EC-") + cow_String(controlsIndex + 1);
            text = text + ", (Controls:" + group.controlsName + ")";
        } else if (elemCtrlMap_.Count() > 0) {
            text = text + ", (Controls:Default)";
        }
        group.controls.SetElemLibrary(ElemLibrary());

        group.beamOriIndex = groups.BeamOriIndex(key);
        if (group.beamOriIndex != -1) {
            const auto& orientation =
                instance.beamOrientations().beamOrientations().ConstGet(group.beamOriIndex);
            text = text + ", (Beam Orientation:" + NameInComment(orientation.RegionRef()) + ")";
        }
        if (const int index = groups.MatOriIndex(key); index != -1) {
            const auto& orientation = nex_canDynamicCastRef<ptoC_MaterialOrientation>(
                instance.materialOrientations().materialOrientations().ConstGet(index), NEX_HERE);
            text = text + ", (Material Orientation:" + NameInComment(orientation.RegionRef()) + ")";
            if (!orientation.datum.IsNullRef()) {
                group.orientationName = OrientationName(instance, index);
                CreateMaterialOrientation(instance, orientation, group.orientationName);
            }
        }

        AddInstanceDefinition(instance.name(), oif_Comment(text));
        if (isPartial) {
            const oif_SetLabels labels(std::make_shared<GroupLabels>(instance.mesh(), made, key));
            AddInstanceDefinition(instance.name(), oif_Elset(labels, group.setName, cow_String(), true));
        }
        CreateSection(instance, group);
    }
}

void oif_PartAttributesBuilder::CreateMaterialOrientation(const ddb_PartInstance& instance,
                                                          const ptoC_MaterialOrientation& orientation,
                                                          const cow_String& name) {
    if (!writtenOrientations_.insert(name).second) return;
    AddInstanceDefinition(instance.name(), oif_Orientation(Model().Model(), orientation, name, gsl_Matrix()));
}

void oif_PartAttributesBuilder::CreateSection(const ddb_PartInstance& instance, const Group& group) {
    const cow_String& name = group.sectionName;
    if (!Model().Sections().IsMember(name)) return;
    const nex_Context context("section", name);
    const kseC_Section& section = Model().Sections().ConstGet(name);
    const SectionRow* row = FindSectionRow(section.DynTypeId());
    if (row == nullptr || row->writesComment) {
        AddInstanceDefinition(instance.name(), oif_Comment(cow_String("Section: ") + name));
    }
    if (row == nullptr) return;
    Group passed = group;
    if (ElemLibrary() == bme_ElemLibrary::NONE) passed.controlsName = {};
    row->create(*this, instance, section, passed);
}

void oif_PartAttributesBuilder::CreateSolidSection(const ddb_PartInstance& instance,
                                                   const kseC_Section& section, const Group& group) {
    AddInstanceDefinition(
        instance.name(), oif_SolidSection(group.setName, section, group.orientationName, group.controlsName));
    AddHourglassStiffness(instance, group);
}

void oif_PartAttributesBuilder::CreateTrussSection(const ddb_PartInstance& instance,
                                                   const kseC_Section& section, const Group& group) {
    // The orientation stands in the controls' place; a truss writes neither.
    AddInstanceDefinition(instance.name(),
                          oif_SolidSection(group.setName, section, cow_String(), group.orientationName));
}

void oif_PartAttributesBuilder::CreateShellSection(const ddb_PartInstance& instance,
                                                   const kseC_Section& section, const Group& group) {
    AddInstanceDefinition(instance.name(), oif_ShellSection(group.setName, section, group.orientationName,
                                                            group.controlsName, group.offset));
    AddShellStiffness(instance, section, group);
}

void oif_PartAttributesBuilder::CreateShellGeneralSection(const ddb_PartInstance& instance,
                                                          const kseC_Section& section, const Group& group) {
    AddInstanceDefinition(instance.name(),
                          oif_ShellGeneralSection(group.setName, section, group.orientationName,
                                                  group.controlsName, group.offset));
    AddShellStiffness(instance, section, group);
}

void oif_PartAttributesBuilder::AddShellStiffness(const ddb_PartInstance& instance,
                                                  const kseC_Section& section, const Group& group) {
    const auto* geometry = nex_canDynamicCastPtr<kseC_GeometryShellSection>(&section);
    if (geometry != nullptr && !geometry->transverseShear.IsNull()) {
        AddInstanceDefinition(instance.name(), oif_TransverseShear(geometry->transverseShear.ConstGet()));
    }
    AddHourglassStiffness(instance, group);
}

void oif_PartAttributesBuilder::CreateMembraneSection(const ddb_PartInstance& instance,
                                                      const kseC_Section& section, const Group& group) {
    AddInstanceDefinition(instance.name(), oif_MembraneSection(group.setName, section, group.orientationName,
                                                               group.controlsName));
    AddHourglassStiffness(instance, group);
}

void oif_PartAttributesBuilder::CreateGasketSection(const ddb_PartInstance& instance,
                                                    const kseC_GasketSection& gasket, const Group& group) {
    const mdl_MapString2ObjCow<kmaC_Material>& materials = Model().Materials();
    const bool hasBehavior = materials.IsMember(gasket.materialName) &&
                             oif_HasGasketOptions(materials.ConstGet(gasket.materialName));
    AddInstanceDefinition(instance.name(),
                          oif_GasketSection(group.setName, gasket, hasBehavior, group.orientationName));
    AddHourglassStiffness(instance, group);
}

void oif_PartAttributesBuilder::CreatePointSection(const ddb_PartInstance& instance,
                                                   const kseC_PointSection& point, const Group& group) {
    const oif_Mass mass(group.setName, point);
    if (!mass.IsEmpty()) AddInstanceDefinition(instance.name(), mass);
    const oif_RotaryI inertia(group.setName, point, group.orientationName);
    if (!inertia.IsEmpty()) AddInstanceDefinition(instance.name(), inertia);
}

void oif_PartAttributesBuilder::CreateBeamSection(const ddb_PartInstance& instance,
                                                  const kseC_BeamSection& beam, const Group& group) {
    AddInstanceDefinition(instance.name(), oif_Comment(cow_String("Section: ") + group.sectionName +
                                                       "  Profile: " + beam.profileName));
    const kbpC_BeamProfile& profile = Model().BeamProfiles().ConstGet(beam.profileName);
    gsl_Vector vector(0.0, 0.0, -1.0);
    if (group.beamOriIndex != -1) {
        const auto& orientation = instance.beamOrientations().beamOrientations().ConstGet(group.beamOriIndex);
        vector = nex_canDynamicCastRef<ptoC_BeamOrientation>(orientation, NEX_HERE).vector;
    }
    if (beam.integration == kseC_BeamSection::IntegrationEnm::DURING_ANALYSIS) {
        AddInstanceDefinition(instance.name(), oif_BeamSection(group.setName, beam, vector, profile));
    } else {
        AddInstanceDefinition(instance.name(), oif_BeamGeneralSection(group.setName, beam, vector, profile));
    }
}

void oif_PartAttributesBuilder::AddHourglassStiffness(const ddb_PartInstance& instance, const Group& group) {
    if (IsStandard()) AddInstanceDefinition(instance.name(), oif_HourglassStiffness(group.controls));
}

void oif_PartAttributesBuilder::CreateElementControls() {
    bool hasComment = false;
    // The defaults, "EC-0", would come first; they are never written.
    for (int key = 0; key < nextElemCtrlKey_; ++key) {
        const oif_SectionControls controls(elemCtrlMap_.ConstGet(key),
                                           cow_String("EC-") + cow_String(key + 1), IsStandard());
        if (controls.IsEmpty()) continue;
        if (!hasComment) AddModelDefinition(oif_Comment("\nELEMENT CONTROLS\n"));
        hasComment = true;
        AddModelDefinition(controls);
    }
}

bme_ElemLibrary oif_PartAttributesBuilder::ElemLibrary() const {
    switch (ModelInfo().AnalysisProduct()) {
    case kprC_AnalysisProductEnm::IMPLICIT: return bme_ElemLibrary::STANDARD;
    case kprC_AnalysisProductEnm::EXPLICIT: return bme_ElemLibrary::EXPLICIT;
    default: return bme_ElemLibrary::NONE;
    }
}
