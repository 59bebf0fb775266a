#ifndef QRX_STORE_ODB_ODB_H
#define QRX_STORE_ODB_ODB_H

#include "store_interface/model/ddb_Model.h"
#include "store_interface/model/odiK_Model.h"

/// View on all models of a store.
class ddb_Ddb {
public:
    explicit ddb_Ddb(const std::map<cow_String, cow_CountedHld<odiK_Model>>& models) : models_(&models) {}
    /// The model, completed; a name that is not there, or a model that can't be completed, raises.
    ddb_Model model(const cow_String& name) const;

private:
    const std::map<cow_String, cow_CountedHld<odiK_Model>>* models_;
};

/// The open store: models by name, held in memory. Programs fill it through AddModel(); readers see it
/// through ddb(). Must outlive every view on it.
class odb_Odb {
public:
    /// The name of the model that decks are written from, unless another is chosen.
    static const char* DefaultModelName() { return "Default Model"; }

    odb_Odb() = default;
    odb_Odb(const odb_Odb&) = delete;
    odb_Odb& operator=(const odb_Odb&) = delete;

    /// Adds an empty model; a name that is taken raises.
    odiK_Model& AddModel(const cow_String& name);
    /// The model, or null.
    odiK_Model* FindModel(const cow_String& name) const;
    const std::map<cow_String, cow_CountedHld<odiK_Model>>& Models() const { return models_; }
    ddb_Ddb ddb() const { return ddb_Ddb(models_); }

    /// The model that decks are written from; its name reaches no deck.
    const cow_String& DeckModelName() const { return deckModelName_; }
    void SetDeckModelName(const cow_String& name) { deckModelName_ = name; }
    /// Null when it isn't there.
    odiK_Model* DeckModel() const { return FindModel(deckModelName_); }

private:
    std::map<cow_String, cow_CountedHld<odiK_Model>> models_;
    cow_String deckModelName_ = DefaultModelName();
};

#endif
