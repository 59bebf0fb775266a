#include "store_interface/records/cls_ClassRegistrar.h"

#include "store_interface/model/ddb_Assembly.h"
#include "store_interface/records/amplitudes/kamC_Amplitude.h"
#include "store_interface/records/conditions/kbcC_BC.h"
#include "store_interface/records/constraints/kcoC_Constraint.h"
#include "store_interface/records/interactions/kinC_Interaction.h"
#include "store_interface/records/materials/kmaC_Material.h"
#include "store_interface/records/output/korC_Output.h"
#include "store_interface/records/part_attributes/bme_ElemCtrlParams.h"
#include "store_interface/records/part_attributes/ptoC_PartAttribute.h"
#include "store_interface/records/sections/kseC_Section.h"

#include <cstdio>
#include <string>

cls_MetadataRegistrar::cls_MetadataRegistrar() {
    registrar_.AddView(ddb_BaseInstance::Class, 0);
    registrar_.AddView(ddb_PartInstance::Class, ddb_BaseInstance::TypeId());
    registrar_.Add<kprC_PropagatingObject>();
    cls_RegisterStepRecords(registrar_);
    cls_RegisterMaterialRecords(registrar_);
    cls_RegisterAmplitudeRecords(registrar_);
    cls_RegisterSectionRecords(registrar_);
    cls_RegisterElementControlRecords(registrar_);
    cls_RegisterPartAttributeRecords(registrar_);
    cls_RegisterConditionRecords(registrar_);
    cls_RegisterInteractionRecords(registrar_);
    cls_RegisterConstraintRecords(registrar_);
    cls_RegisterOutputRecords(registrar_);
}

void cls_ClassRegistrar::AddEntry(const cls_ClassEntry& entry) {
    const unsigned id = entry.info.Id();
    if (id == entry.baseId || byId_.count(id) != 0 || FindByName(entry.info.name) != nullptr) {
        const std::string text = std::string("class registered twice: ") + entry.info.name;
        nex_Raise(atr_String(std::string_view(text)));
    }
    byId_.emplace(id, entries_.size());
    entries_.push_back(entry);
}

bool cls_ClassRegistrar::InheritanceCheck(const unsigned& derived, const unsigned& base) const {
    unsigned id = derived;
    for (;;) {
        if (id == base) return true;
        const cls_ClassEntry* entry = Find(id);
        if (entry == nullptr || entry->baseId == 0) return false;
        id = entry->baseId;
    }
}

const cls_ClassEntry* cls_ClassRegistrar::Find(unsigned id) const {
    const auto place = byId_.find(id);
    return place == byId_.end() ? nullptr : &entries_[place->second];
}

const cls_ClassEntry* cls_ClassRegistrar::FindByName(std::string_view name) const {
    for (const cls_ClassEntry& entry : entries_) {
        if (name == entry.info.name) return &entry;
    }
    return nullptr;
}

std::vector<const cls_ClassEntry*> cls_ClassRegistrar::ConcreteClasses(unsigned base) const {
    std::vector<const cls_ClassEntry*> classes;
    for (const cls_ClassEntry& entry : entries_) {
        if (entry.create != nullptr && InheritanceCheck(entry.info.Id(), base)) classes.push_back(&entry);
    }
    return classes;
}

cow_String cls_ClassRegistrar::NameOf(unsigned id) const {
    const cls_ClassEntry* entry = Find(id);
    if (entry != nullptr) return entry->info.name;
    char text[32];
    std::snprintf(text, sizeof text, "class 0x%X", id);
    return text;
}

void nex_CheckCast(unsigned found, unsigned expected, nex_Position position) {
    if (found == expected || cls_Classes().InheritanceCheck(found, expected)) return;
    nex_RaiseCastFailure(cls_Classes().NameOf(found).CStr(), cls_Classes().NameOf(expected).CStr(), position);
}
