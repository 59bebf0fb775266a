#ifndef QRX_TOOLS_CONSTRAINTCHECKS_H
#define QRX_TOOLS_CONSTRAINTCHECKS_H

#include "tools/ModelChecks.h"

/// Adds what is to be said of constraints: regions that are missing or of the wrong kind, equations without
/// terms, cyclic symmetry that makes writing fail.
void FindConstraintProblems(const odiK_Model& model, std::vector<ModelFinding>& findings);

#endif
