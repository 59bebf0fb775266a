#ifndef QRX_OIF_CARD_H
#define QRX_OIF_CARD_H

#include "base/oif_Op.h"
#include "store_interface/records/conditions/kbcC_BC.h"
#include "store_interface/records/conditions/kloC_Load.h"
#include "store_interface/records/conditions/kpfC_Field.h"

/// Which card is being made: what an object says in a step, or in one of its load cases.
template <class T>
struct oif_CardOf {
    cow_String name;
    /// All cards of the object share it.
    mdl_ObjCow<T> object;
    /// The deck's name of the object's region.
    cow_String setName;
    cow_String step;
    oif_Op op = oif_Op::MODIFY;
    /// Empty for the step itself.
    cow_String loadCase = {};
    float scale = 1.0F;

    const T& Object() const { return object.ConstGet(); }
    auto Quad() const { return Object().ConstGetStateQuad(step); }
    bool InLoadCase() const { return !loadCase.IsEmpty(); }
    double Factor() const { return static_cast<double>(scale); }
};

using oif_BCCard = oif_CardOf<kbcC_BC>;
using oif_LoadCard = oif_CardOf<kloC_Load>;
using oif_FieldCard = oif_CardOf<kpfC_Field>;

#endif
