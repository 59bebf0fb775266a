#ifndef QRX_OIF_REGIONBUILDER_H
#define QRX_OIF_REGIONBUILDER_H

#include "base/oif_Component.h"

/// Named regions: the sets and surfaces of every instance in its block, those of the assembly in the
/// assembly, and a node-based surface for each node set that contact uses as one.
class oif_RegionBuilder final : public oif_ComponentOf<oif_RegionBuilder> {
public:
    using oif_ComponentOf::oif_ComponentOf;
    void Build() override;

private:
    void CreateInstanceRegions(const ddb_PartInstance& instance);
    void CreateAssemblyRegions();
    void CreateContactNodeSets();
};

#endif
