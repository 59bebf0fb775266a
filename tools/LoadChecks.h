#ifndef QRX_TOOLS_LOADCHECKS_H
#define QRX_TOOLS_LOADCHECKS_H

#include "store_interface/model/ddb_Model.h"
#include "tools/ModelChecks.h"

/// Looks through the loads and predefined fields of a model that is whole: what no step writes, what a deck
/// tells in a comment only, what stands on a set of the wrong kind, and what makes writing fail.
std::vector<ModelFinding> LoadFindingsOf(const ddb_Model& model);

#endif
