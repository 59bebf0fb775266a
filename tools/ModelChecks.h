#ifndef QRX_TOOLS_MODELCHECKS_H
#define QRX_TOOLS_MODELCHECKS_H

#include "store_interface/model/odiK_Model.h"

#include <string>
#include <vector>

/// Something that makes the model's deck incomplete without a word, or fail.
struct ModelFinding {
    std::string place; ///< what it is about, as a JSON pointer into the model
    std::string text;
};

/// Looks through a model that is whole: what the deck writer takes as it is, and a solver can't.
std::vector<ModelFinding> FindingsOf(const odiK_Model& model);

#endif
