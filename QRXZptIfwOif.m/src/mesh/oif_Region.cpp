#include "mesh/oif_Region.h"

#include "base/oif_Model.h"

oif_Region::oif_Region(const qkw_Model& model, const rgnC_Region& region) {
    if (!region.Shortcut().HasValue()) return;
    const auto find = [&](const ddb_SetList& sets) {
        for (const ddb_Set& set : sets) {
            if (!(set.Shortcut() == region.Shortcut())) continue;
            setName_ = set.setLabel();
            return true;
        }
        return false;
    };
    const ddb_Assembly assembly = static_cast<const oif_Model&>(model).Model().rootAssembly();
    if (find(assembly.set())) return;
    for (const auto& [name, entry] : assembly.instance()) {
        if (!entry.IsPartInstance()) continue;
        const ddb_PartInstance instance(entry);
        if (!find(instance.mesh().set())) continue;
        instanceName_ = instance.name();
        return;
    }
}

cow_String oif_Region::FullName() const {
    return instanceName_.IsEmpty() ? setName_ : instanceName_ + "." + setName_;
}
