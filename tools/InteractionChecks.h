#ifndef QRX_TOOLS_INTERACTIONCHECKS_H
#define QRX_TOOLS_INTERACTIONCHECKS_H

#include "tools/ModelChecks.h"

/// Adds what is to be said of interactions: those that make the deck fail, those that no step writes, regions
/// of the wrong kind, contact without a property or of the other solver. Suppressed ones are passed over.
void FindInteractionProblems(const odiK_Model& model, std::vector<ModelFinding>& findings);

#endif
