#ifndef QRX_OIF_OUTPUTREQUESTBUILDER_H
#define QRX_OIF_OUTPUTREQUESTBUILDER_H

#include "deck/oif_Component.h"

/// Controls, restart and output requests that close the steps.
class oif_OutputRequestBuilder final : public oif_ComponentOf<oif_OutputRequestBuilder> {
public:
    using oif_ComponentOf::oif_ComponentOf;
    void Build() override;
};

#endif
