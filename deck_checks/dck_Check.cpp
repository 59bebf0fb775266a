#include "deck_checks/dck_Check.h"

#include "base/oif_ModelInfo.h"
#include "deck_checks/dck_Checks.h"
#include "store_interface/model/odb_Odb.h"

#include <algorithm>

void dck_CheckDeck(const odb_Odb& store, const cow_String& modelName, fnd_Sink& sink) {
    const odiK_Model& model = *store.FindModel(modelName);
    const fnd_Path root;
    const fnd_Path models(root, "models");
    const fnd_Path place(models, modelName.View());
    fnd_Below below(sink, place);
    dck_CheckSections(model, below);
    dck_CheckConditions(model, below);
    dck_CheckInteractions(model, below);
    dck_CheckConstraints(model, below);
    dck_CheckRequests(model, below);
    const oif_ModelInfo info(store.ddb().model(modelName));
    dck_CheckLoads(info, below);
}

std::vector<fnd_Finding> dck_Check(const odb_Odb& store) {
    const cow_String name = odb_Odb::DefaultModelName();
    // Completes the model, or raises.
    static_cast<void>(store.ddb().model(name));
    fnd_List list;
    dck_CheckStore(store, name, list);
    const bool wrong = std::ranges::any_of(list.findings, [](const fnd_Finding& f) { return f.IsError(); });
    if (!wrong) dck_CheckDeck(store, name, list);
    if (!wrong) dck_CheckMeshes(store, name, list);
    return std::move(list.findings);
}
