#include "deck_checks/dck_Checks.h"
#include "deck_checks/dck_Text.h"
#include "materials/oif_Material.h"
#include "sections/oif_ShellSections.h"
#include "store_interface/model/ddb_ElementTypes.h"
#include "store_interface/model/odiK_Model.h"
#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/sections/kseC_BeamSection.h"
#include "store_interface/records/sections/kseC_PointSection.h"
#include "store_interface/records/sections/kseC_ShellSections.h"
#include "store_interface/records/sections/kseC_SolidSections.h"

#include <algorithm>
#include <map>
#include <set>
#include <string_view>

namespace {

std::string Elements(int count) {
    return std::to_string(count) + (count == 1 ? " element" : " elements");
}

bool NeedsSection(const cow_String& label) {
    // Surface elements are not written at all.
    if (label.View().find("SURF") != std::string_view::npos) return false;
    const ddb_ElementFamily* family = ddb_FamilyOf(label.View());
    return family == nullptr || family->section != ddb_SectionNeedEnm::NOTHING;
}

bool CanTake(ddb_SectionNeedEnm need, unsigned section) {
    const auto isOne = [&](unsigned (*id)()) { return cls_Classes().InheritanceCheck(section, id()); };
    switch (need) {
    case ddb_SectionNeedEnm::BEAM: return isOne(kseC_BeamSection::TypeId);
    case ddb_SectionNeedEnm::TRUSS:
        return isOne(kseC_TrussSection::TypeId) || isOne(kseC_SolidSection::TypeId);
    case ddb_SectionNeedEnm::SHELL: return isOne(kseC_ShellSection::TypeId);
    case ddb_SectionNeedEnm::MEMBRANE: return isOne(kseC_MembraneSection::TypeId);
    case ddb_SectionNeedEnm::GASKET: return isOne(kseC_GasketSection::TypeId);
    case ddb_SectionNeedEnm::POINT: return isOne(kseC_PointSection::TypeId);
    case ddb_SectionNeedEnm::SOLID: return isOne(kseC_SolidSection::TypeId);
    case ddb_SectionNeedEnm::NOTHING:
    case ddb_SectionNeedEnm::UNKNOWN: break;
    }
    return true;
}

bool CanTake(const cow_String& label, unsigned section) {
    const ddb_ElementFamily* family = ddb_FamilyOf(label.View());
    // Of other elements nothing is known.
    return family == nullptr || CanTake(family->section, section);
}

/// The sections of the elements of one mesh, as the assignments in their order give them.
void FindInMesh(const odiK_Model& model, const odiK_Mesh& mesh,
                const std::vector<odiK_AttributeInput>& assignments, const std::string& place,
                fnd_Sink& sink) {
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
            const cls_Record** const ofClass =
                sectionOf.data() +
                mesh.Classes()[static_cast<std::size_t>(subset.ClassIndex())].firstElementIndex;
            for (int i = 0, length = 0; i < subset.subset.Length(); i += length) {
                const int* const run = subset.subset.ConstRun(i, length);
                for (int k = 0; k < length; ++k) ofClass[run[k]] = section;
            }
        }
    }

    for (const auto& [section, name] : names) {
        const auto* shell = nex_canDynamicCastPtr<kseC_ShellSection>(section);
        if (shell == nullptr || oif_HasShellLines(*shell)) continue;
        if (std::ranges::find(sectionOf, section) == sectionOf.end()) continue;
        sink.Add("cannot-be-written", Place("sections", name),
                 std::string("writing fails with \"") + oif_kShellError + "\": " + place.substr(1) +
                     " has elements of this section");
    }
    int without = 0;
    for (const odiK_ElementClass& elements : mesh.Classes()) {
        std::map<cow_String, std::pair<const cls_Record*, int>> misfits;
        const bool needsSection = NeedsSection(elements.type);
        const auto end = sectionOf.begin() + elements.firstElementIndex + elements.NumElements();
        for (auto first = end - elements.NumElements(); first != end;) {
            // Neighbours mostly have one section.
            const cls_Record* section = *first;
            const auto next =
                std::find_if(first, end, [section](const cls_Record* s) { return s != section; });
            const int count = static_cast<int>(next - first);
            first = next;
            if (section == nullptr) {
                without += needsSection ? count : 0;
            } else if (!CanTake(elements.type, section->DynTypeId())) {
                misfits.try_emplace(names[section], section, 0).first->second.second += count;
            }
        }
        for (const auto& [name, misfit] : misfits) {
            const auto& [section, count] = misfit;
            sink.Add("wrong-section", place,
                     Elements(count) + " of type " + Quoted(elements.type) + " can't take the section " +
                         Quoted(name) + " (" + Text(cls_Classes().ShortNameOf(section->DynTypeId())) + ")");
        }
    }
    if (without > 0) {
        sink.Add("no-section", place, Elements(without) + (without == 1 ? " has" : " have") + " no section");
    }
}

void FindSectionsOfMeshes(const odiK_Model& model, fnd_Sink& sink) {
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
                   isOwn ? "/assembly" + Place("instances", name) : Place("parts", instance->partName), sink);
    }
}

std::vector<std::string_view> OptionsOf(const kmaC_Material& material) {
    std::vector<std::string_view> names;
    for (const cls_Field& field : material.DynFields().All()) {
        const auto& type = static_cast<const cls_HolderType&>(*field.type);
        if (type.Get(field.In(material)) != nullptr) names.emplace_back(field.name);
    }
    return names;
}

} // namespace

std::vector<dck_IdleOption> dck_IdleGasketOptions(const odiK_Model& model) {
    const auto isIn = [](const auto& names, std::string_view name) {
        return std::ranges::find(names, name) != std::end(names);
    };
    const std::set<cow_String> ofGaskets = oif_MaterialsOfGaskets(model.sections);
    std::vector<dck_IdleOption> idle;
    for (const auto& [name, material] : model.materials) {
        const bool isGasket = ofGaskets.count(name) != 0 && oif_HasGasketOptions(material);
        for (const std::string_view option : OptionsOf(material)) {
            const bool isOfGaskets = isIn(oif_kGasketOptions, option);
            const bool isIdle =
                isGasket ? !isOfGaskets && !isIn(oif_kOptionsBesideGaskets, option) : isOfGaskets;
            if (isIdle) idle.push_back({name, option, isGasket});
        }
    }
    return idle;
}

void dck_CheckSections(const odiK_Model& model, fnd_Sink& sink) {
    FindSectionsOfMeshes(model, sink);
    for (const dck_IdleOption& idle : dck_IdleGasketOptions(model)) {
        sink.Add("not-in-deck", Place("materials", idle.material).append("/").append(idle.option),
                 idle.ofGasket
                     ? "the material is a gasket behaviour, which has no such option, so this will not "
                       "stand in the deck"
                     : "no gasket section names this material, so this will not stand in the deck");
    }
}
