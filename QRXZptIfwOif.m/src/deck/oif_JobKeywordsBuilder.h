#ifndef QRX_OIF_JOBKEYWORDSBUILDER_H
#define QRX_OIF_JOBKEYWORDSBUILDER_H

#include "base/oif_Component.h"

/// The opening text of the deck, which stands before everything else.
class oif_JobKeywordsBuilder final : public oif_ComponentOf<oif_JobKeywordsBuilder> {
public:
    using oif_ComponentOf::oif_ComponentOf;
    void Build() override;
};

#endif
