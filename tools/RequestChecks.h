#ifndef QRX_TOOLS_REQUESTCHECKS_H
#define QRX_TOOLS_REQUESTCHECKS_H

#include "tools/ModelChecks.h"

/// Adds what is to be said of output requests: variables that a procedure or a region can't give, frequencies
/// that a procedure doesn't allow and what is written instead, objects that aren't there. Suppressed requests
/// are passed over; what holds in several steps is said of the first.
void FindRequestProblems(const odiK_Model& model, std::vector<ModelFinding>& findings);

#endif
