#include "tools/ModelChecks.h"

#include "conditions/oif_BCTable.h"
#include "conditions/oif_BoundaryConditionBuilder.h"
#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/conditions/kbcC_MotionBCs.h"
#include "store_interface/records/sections/kseC_BeamSection.h"
#include "store_interface/records/sections/kseC_PointSection.h"
#include "store_interface/records/sections/kseC_ShellSections.h"
#include "store_interface/records/sections/kseC_SolidSections.h"
#include "tools/ConstraintChecks.h"
#include "tools/FindingText.h"
#include "tools/InteractionChecks.h"
#include "tools/RequestChecks.h"

#include <algorithm>
#include <map>
#include <optional>
#include <set>
#include <string_view>

namespace {

using Findings = std::vector<ModelFinding>;

std::string Elements(int count) {
    return std::to_string(count) + (count == 1 ? " element" : " elements");
}

/// Collects the texts of all fields of a record, and of the records in it, that name objects of the kind.
void CollectNames(const cls_FieldType& type, const void* value, const cls_Field& field, std::string_view kind,
                  std::set<std::string>& names) {
    switch (type.Kind()) {
    case cls_FieldKind::String:
        if (field.refersTo != nullptr && field.refersTo == kind) {
            names.insert(Text(*static_cast<const cow_String*>(value)));
        }
        break;
    case cls_FieldKind::List: {
        const auto& list = static_cast<const cls_ListType&>(type);
        for (int i = 0; i < list.Length(value); ++i) {
            CollectNames(list.ItemType(), list.Item(value, i), field, kind, names);
        }
        break;
    }
    case cls_FieldKind::Record:
    case cls_FieldKind::Optional:
    case cls_FieldKind::Variant: {
        const cls_Record* record = static_cast<const cls_HolderType&>(type).Get(value);
        if (record == nullptr) break;
        for (const cls_Field& each : record->DynFields().All()) {
            CollectNames(*each.type, each.In(*record), each, kind, names);
        }
        break;
    }
    default: break;
    }
}

void FindIdleMaterials(const odiK_Model& model, Findings& findings) {
    std::set<std::string> used;
    for (mdl_RepositoryIT it(model.sections); !it.IsDone(); it.Next()) {
        const cls_Record& section = it.CurrentRecord();
        for (const cls_Field& field : section.DynFields().All()) {
            CollectNames(*field.type, field.In(section), field, "material", used);
        }
    }
    for (mdl_RepositoryIT it(model.materials); !it.IsDone(); it.Next()) {
        if (used.count(Text(it.CurrentKey())) != 0) continue;
        findings.push_back({Place("materials", it.CurrentKey()), "no section uses the material"});
    }
}

/// The sections that elements of a kind can take, by the beginnings of their type labels.
struct ElementFamily {
    std::string_view beginning;
    unsigned (*sections[2])();
};

constexpr ElementFamily kFamilies[] = {
    {"B2", {kseC_BeamSection::TypeId}},
    {"B3", {kseC_BeamSection::TypeId}},
    {"PIPE", {kseC_BeamSection::TypeId}},
    {"ELBOW", {kseC_BeamSection::TypeId}},
    {"FRAME", {kseC_BeamSection::TypeId}},
    {"T2D", {kseC_TrussSection::TypeId, kseC_SolidSection::TypeId}},
    {"T3D", {kseC_TrussSection::TypeId, kseC_SolidSection::TypeId}},
    {"S3", {kseC_ShellSection::TypeId}},
    {"S4", {kseC_ShellSection::TypeId}},
    {"S8", {kseC_ShellSection::TypeId}},
    {"S9", {kseC_ShellSection::TypeId}},
    {"STRI", {kseC_ShellSection::TypeId}},
    {"DS", {kseC_ShellSection::TypeId}},
    {"SAX", {kseC_ShellSection::TypeId}},
    {"DSAX", {kseC_ShellSection::TypeId}},
    {"SC", {kseC_ShellSection::TypeId}},
    {"M3D", {kseC_MembraneSection::TypeId}},
    {"MAX", {kseC_MembraneSection::TypeId}},
    {"MGAX", {kseC_MembraneSection::TypeId}},
    {"GK", {kseC_GasketSection::TypeId}},
    {"MASS", {kseC_PointSection::TypeId}},
    {"ROTARYI", {kseC_PointSection::TypeId}},
    {"C3D", {kseC_SolidSection::TypeId}},
    {"CPE", {kseC_SolidSection::TypeId}},
    {"CPS", {kseC_SolidSection::TypeId}},
    {"CAX", {kseC_SolidSection::TypeId}},
    {"CGAX", {kseC_SolidSection::TypeId}},
    {"DC1D", {kseC_SolidSection::TypeId}},
    {"DC2D", {kseC_SolidSection::TypeId}},
    {"DC3D", {kseC_SolidSection::TypeId}},
    {"DCAX", {kseC_SolidSection::TypeId}},
    {"AC2D", {kseC_SolidSection::TypeId}},
    {"AC3D", {kseC_SolidSection::TypeId}},
    {"ACAX", {kseC_SolidSection::TypeId}},
};

/// Elements that have no section of their own: rigid ones, and connectors, whose section is the assembly's.
constexpr std::string_view kWithoutSection[] = {"R2D", "R3D", "RAX", "RB", "CONN"};

bool BeginsWith(const cow_String& label, std::string_view beginning) {
    return label.View().size() >= beginning.size() &&
           omu_EqualInAnyCapitals(label.View().substr(0, beginning.size()), beginning);
}

const ElementFamily* FamilyOf(const cow_String& label) {
    const ElementFamily* found = nullptr;
    for (const ElementFamily& family : kFamilies) {
        if (BeginsWith(label, family.beginning) &&
            (found == nullptr || family.beginning.size() > found->beginning.size())) {
            found = &family;
        }
    }
    return found;
}

bool NeedsSection(const cow_String& label) {
    // Surface elements are not written at all.
    if (label.View().find("SURF") != std::string_view::npos) return false;
    return std::none_of(std::begin(kWithoutSection), std::end(kWithoutSection),
                        [&](std::string_view beginning) { return BeginsWith(label, beginning); });
}

bool CanTake(const cow_String& label, unsigned section) {
    const ElementFamily* family = FamilyOf(label);
    // Of other elements nothing is known.
    if (family == nullptr) return true;
    return std::any_of(std::begin(family->sections), std::end(family->sections), [&](unsigned (*id)()) {
        return id != nullptr && cls_Classes().InheritanceCheck(section, id());
    });
}

/// The sections of the elements of one mesh, as the assignments in their order give them.
void FindInMesh(const odiK_Model& model, const odiK_Mesh& mesh,
                const std::vector<odiK_AttributeInput>& assignments, const std::string& place,
                Findings& findings) {
    std::vector<const cls_Record*> sectionOf(static_cast<std::size_t>(mesh.NumElements()), nullptr);
    std::map<const cls_Record*, cow_String> names;
    for (const odiK_AttributeInput& input : assignments) {
        const auto& assignment = static_cast<const ptoC_SectionAssignment&>(input.record.ConstGet());
        const cls_Record* section = model.sections.FindRecord(assignment.sectionName);
        const int set = mesh.FindSet(input.setName);
        if (section == nullptr || set < 0) continue;
        names[section] = assignment.sectionName;
        for (const rgnC_SubsetData& subset : mesh.Sets()[static_cast<std::size_t>(set)]->subsets) {
            if (subset.ClassIndex() < 0) continue;
            const int first = mesh.Classes()[static_cast<std::size_t>(subset.ClassIndex())].firstElementIndex;
            for (int i = 0; i < subset.subset.Length(); ++i) {
                sectionOf[static_cast<std::size_t>(first + subset.subset[i])] = section;
            }
        }
    }

    int without = 0;
    for (const odiK_ElementClass& elements : mesh.Classes()) {
        std::map<const cls_Record*, int> misfits;
        for (int i = 0; i < elements.NumElements(); ++i) {
            const cls_Record* section = sectionOf[static_cast<std::size_t>(elements.firstElementIndex + i)];
            if (section == nullptr) {
                if (NeedsSection(elements.type)) ++without;
            } else if (!CanTake(elements.type, section->DynTypeId())) {
                ++misfits[section];
            }
        }
        for (const auto& [section, count] : misfits) {
            findings.push_back({place, Elements(count) + " of type " + Quoted(elements.type) +
                                           " can't take the section " + Quoted(names[section]) + " (" +
                                           Text(cls_Classes().NameOf(section->DynTypeId())) + ")"});
        }
    }
    if (without > 0) {
        findings.push_back({place, Elements(without) + (without == 1 ? " has" : " have") + " no section"});
    }
}

void FindSectionsOfMeshes(const odiK_Model& model, Findings& findings) {
    std::set<cow_String> shownParts;
    for (const auto& [name, instance] : model.Instances()) {
        if (!instance->isPartInstance) continue;
        const auto mesh = instance->Mesh();
        if (mesh.IsNull() || instance->part.IsNull()) continue;
        const bool isOwn = !instance->ownMesh.IsNull() || instance->ownSectionAssignments.has_value();
        // Instances that only show their part have its findings.
        if (!isOwn && !shownParts.insert(instance->partName).second) continue;
        FindInMesh(model, *mesh,
                   instance->ownSectionAssignments ? *instance->ownSectionAssignments
                                                   : instance->part->attributes.sectionAssignments,
                   isOwn ? "/assembly" + Place("instances", name) : Place("parts", instance->partName),
                   findings);
    }
}

/// The names of the model's element sets, as lists of sets refer to them.
std::set<std::string> ElementSetsOf(const odiK_Model& model) {
    std::set<std::string> names;
    const auto add = [&names](const std::string& prefix, const auto& sets) {
        for (const auto& set : sets) {
            if (set->type == res_SetTypeEnm::ELEMENTS) names.insert(prefix + Text(set->name));
        }
    };
    add("", model.AssemblySets());
    for (const auto& [name, instance] : model.Instances()) {
        const auto mesh = instance->Mesh();
        if (!mesh.IsNull()) add(Text(name) + ".", mesh->Sets());
    }
    return names;
}

void FindOnRegion(const kbcC_BC& bc, const std::string& place, Findings& findings) {
    const oif_RegionKind expected = oif_FindBCRow(bc.DynTypeId())->region;
    if (!bc.region.HasValue()) {
        findings.push_back({place, "the condition has no region, so its lines name no set"});
    } else if (bc.region.FlagWord() != static_cast<int>(expected)) {
        const bool ofConnectors = expected == oif_RegionKind::ELEMENTS;
        findings.push_back({place + "/region", "found " + Quoted(bc.region.SetName()) + ", which is " +
                                                   KindOf(bc.region) + "; the condition acts on " +
                                                   (ofConnectors ? "connector elements" : "nodes")});
    }
}

void FindOnConditions(const odiK_Model& model, Findings& findings) {
    const oif_BCOpStatus status =
        oif_BoundaryConditionBuilder::OpStatusOf(model.boundaryConditions, model.loads, model.steps);
    std::optional<std::set<std::string>> elementSets;
    for (const auto& [name, bc] : model.boundaryConditions) {
        if (bc.suppressed) continue;
        const std::string place = Place("boundaryConditions", name);
        FindOnRegion(bc, place, findings);
        if (const auto* motion = nex_canDynamicCastPtr<kbcC_ConnectorBC>(&bc)) {
            if (!elementSets) elementSets = ElementSetsOf(model);
            if (motion->connectors.IsEmpty()) {
                findings.push_back({place + "/connectors",
                                    "the condition names no connectors, so no element set carries its name"});
            }
            for (int i = 0; i < motion->connectors.Length(); ++i) {
                if (elementSets->count(Text(motion->connectors[i])) != 0) continue;
                findings.push_back({place + "/connectors/" + std::to_string(i),
                                    "found " + Quoted(motion->connectors[i]) + ", which is no element set"});
            }
        }
        bool written = false;
        for (const auto& [stepName, step] : model.steps) {
            for (const auto& at : oif_BCOpStatus::Places(step, name, bc.Status(stepName))) {
                written = written || status.Writes(bc, stepName, at.IsLoadCase());
            }
        }
        if (!written) findings.push_back({place, "no step writes the condition"});
    }
}

} // namespace

std::vector<ModelFinding> FindingsOf(const odiK_Model& model) {
    Findings findings;
    FindSectionsOfMeshes(model, findings);
    FindIdleMaterials(model, findings);
    FindOnConditions(model, findings);
    FindInteractionProblems(model, findings);
    FindConstraintProblems(model, findings);
    FindRequestProblems(model, findings);
    return findings;
}
