#ifndef QRX_DCK_WALK_H
#define QRX_DCK_WALK_H

#include "store_interface/model/odiK_Repositories.h"

#include <functional>

/// Calls `visit` with every record of a model, those in other records and the states that were given
/// included, and its place below the model. Of a state only the fields that were given count; `given` is null
/// elsewhere.
using dck_Visit =
    std::function<void(const cls_Record& record, const mdl_GivenState* given, const fnd_Path& place)>;
/// First the model's own and those of its tree, then those of each repository.
void dck_ForEachRecordOfTree(const odiK_Model& model, const dck_Visit& visit);
void dck_ForEachRecordOf(const odiK_Repository& repository, const odiK_Model& model, const dck_Visit& visit);

/// Whether the user said something of a field of a record or state.
bool dck_IsGiven(const mdl_GivenState* given, std::size_t field);

#endif
