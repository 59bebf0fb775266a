#ifndef QRX_TESTS_FAULTS_STORE_H
#define QRX_TESTS_FAULTS_STORE_H

#include "store_interface/model/odb_Odb.h"

/// Fills a store with two instances of a part of `nodes` nodes and as many trusses less one, with sets, a
/// surface and solver input.
void FillStore(odb_Odb& odb, int nodes);

#endif
