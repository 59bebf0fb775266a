#include "store_interface/model/odb_Odb.h"

#include "foundation/nex_Exception.h"

ddb_Model ddb_Ddb::model(const cow_String& name) const {
    const auto place = models_->find(name);
    if (place == models_->end()) cow_RaiseNoSuchKey("ddb_Ddb", name);
    place->second->EnsureComplete();
    return ddb_Model(place->second);
}

odiK_Model& odb_Odb::AddModel(const cow_String& name) {
    if (models_.count(name) != 0) {
        const std::string text = "a model named '" + std::string(name.View()) + "' is there already";
        nex_Raise(atr_String(std::string_view(text)));
    }
    cow_CountedHld<odiK_Model> model(new odiK_Model(name));
    return *models_.emplace(name, std::move(model)).first->second;
}

odiK_Model* odb_Odb::FindModel(const cow_String& name) const {
    const auto place = models_.find(name);
    return place == models_.end() ? nullptr : place->second.Referent();
}
