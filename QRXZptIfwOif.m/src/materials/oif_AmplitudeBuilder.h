#ifndef QRX_OIF_AMPLITUDEBUILDER_H
#define QRX_OIF_AMPLITUDEBUILDER_H

#include "deck/oif_Component.h"

/// Amplitudes of the model.
class oif_AmplitudeBuilder final : public oif_ComponentOf<oif_AmplitudeBuilder> {
public:
    using oif_ComponentOf::oif_ComponentOf;
    void Build() override;
};

#endif
