#ifndef QRX_STORE_KPRC_STEPWORDS_H
#define QRX_STORE_KPRC_STEPWORDS_H

#include <string>

class kprC_Step;

/// The procedure of a step for people to read: of a kprC_StaticLinearPerturbationStep "static linear
/// perturbation".
std::string kprC_ProcedureWords(const kprC_Step& step);

#endif
