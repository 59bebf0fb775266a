#ifndef QRX_OIF_FINALBUILDER_H
#define QRX_OIF_FINALBUILDER_H

#include "base/oif_Component.h"

/// The texts that the store keeps for each block, and the keywords that close the blocks. The last component
/// of all, so that these stand behind what the others say.
class oif_FinalBuilder final : public oif_ComponentOf<oif_FinalBuilder> {
public:
    using oif_ComponentOf::oif_ComponentOf;
    void Build() override;
};

#endif
