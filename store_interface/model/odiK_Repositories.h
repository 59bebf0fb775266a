#ifndef QRX_STORE_ODIK_REPOSITORIES_H
#define QRX_STORE_ODIK_REPOSITORIES_H

#include "store_interface/model/odiK_Model.h"

#include <bitset>

/// One of a model's repositories, for code that treats all of them alike.
struct odiK_Repository {
    const char* member;   ///< in model files, and in odiK_Model
    const char* singular; ///< "a load"
    const char* plural;   ///< "loads"
    /// The word by which fields say that they refer to its objects; null when none does.
    const char* kind;
    /// Why none of its objects reaches a deck; null when they do.
    const char* whyNotInDeck;
    unsigned (*itemTypeId)();
    bool propagating;
    /// Null for the steps, whose order counts: these are no mdl_Repository.
    mdl_Repository& (*in)(odiK_Model& model);

    /// Its objects live across steps.
    bool IsPropagating() const { return propagating; }
    bool IsInOrder() const { return in == nullptr; }
    bool ReachesDeck() const { return whyNotInDeck == nullptr; }
    /// The class that all its records derive from.
    unsigned ItemTypeId() const { return itemTypeId(); }
    mdl_Repository& In(odiK_Model& model) const { return in(model); }
    const mdl_Repository& In(const odiK_Model& model) const { return in(const_cast<odiK_Model&>(model)); }
};

/// All repositories in the order in which model files hold them: what others refer to comes first, and the
/// steps before what lives across them.
std::span<const odiK_Repository> odiK_Repositories();

/// Some of a model: repositories by their rows, and as one all that is none, such as parts, sets and steps.
using odiK_Extent = std::bitset<32>;

/// What was read meanwhile. What is no repository always counts.
odiK_Extent odiK_ReadOf(const mdl_ReadNotes& notes);
/// Where the objects of two models may differ, one of which has been made by sharing the other's.
odiK_Extent odiK_Differences(const odiK_Model& a, const odiK_Model& b);

#endif
