#ifndef QRX_OIF_TRANSFORMBUILDER_H
#define QRX_OIF_TRANSFORMBUILDER_H

#include "base/oif_Component.h"
#include "store_interface/records/part_attributes/ptoC_PartAttribute.h"

/// The local systems that the model uses: for each one that degrees of freedom are given in, a node set with
/// all its regions as members and a transform on it; and an orientation for each system of a connector, a
/// coupling or an inertia relief load.
class oif_TransformBuilder final : public oif_ComponentOf<oif_TransformBuilder> {
public:
    using oif_ComponentOf::oif_ComponentOf;
    void Build() override;

private:
    void CollectCsysRegionsList();
    void WriteTransforms();
    void WriteConnectorOrientations();
    void WriteCouplingOrientations();
    void WriteInertiaReliefOrientations();
    /// Stores an orientation with its rotation line, unless there is one of this name. The null reference
    /// gives none. The name ends in the suffix if the angle isn't 0.
    void WriteOrientation(const dtmC_DatumRef& datum, double angle, const cow_String& suffix,
                          ptoC_MaterialOrientation::axisEnm axis);
    cow_String ConstGetDatumName(const dtmC_DatumRef& datum) const;

    // The two lists go entry by entry.
    cow_List<rgnC_Region> regions_;
    cow_List<dtmC_DatumRef> datums_;
    cow_List<cow_String> orientationNames_;
};

#endif
