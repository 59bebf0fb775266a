#ifndef QRX_STORE_ODIK_MODELRULES_H
#define QRX_STORE_ODIK_MODELRULES_H

#include "store_interface/findings/fnd_Finding.h"

class odiK_Model;

/// What a whole model must satisfy that no single record shows: lists in the states of general contact no
/// longer than the pairs that they belong to; a node set of the assembly behind each term of an equation with
/// a coordinate system; a sector definition that has a symmetry; codes of findings that may be ignored.
/// Places are below the model.
void odiK_CheckModelRules(const odiK_Model& model, fnd_Sink& sink);

#endif
