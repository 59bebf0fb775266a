#ifndef QRX_OIF_MASSSCALING_H
#define QRX_OIF_MASSSCALING_H

#include "base/oif_KeywordLine.h"
#include "keyword_layer/qkw_Keyword.h"
#include "store_interface/records/steps/kprC_DynamicSteps.h"

/// What the two mass scaling keywords share: the record and the set's name, in the form that decks refer to
/// it by.
class oif_MassScaling {
protected:
    oif_MassScaling(const kprC_MassScaling& scaling, const cow_String& setName)
        : scaling_(scaling), setName_(setName) {}

    void WriteKind(utl_Stream& stream, const char* kind) const;
    void WriteRegion(utl_Stream& stream) const;
    void AddRegion(oif_KeywordLine& line) const;
    void AddDt(oif_KeywordLine& line) const;
    void AddRecurrence(oif_KeywordLine& line) const;

    kprC_MassScaling scaling_;
    cow_String setName_;
};

/// Mass scaling once, at the beginning of a step:
///     ** Mass Scaling: Semi-Automatic
///     **               SET
///     *Fixed Mass Scaling, elset=SET, dt=1e-05, type=below min, factor=2.
/// or the reinitialisation of the mass. Another kind writes an empty line.
class oif_FixedMassScaling final : public qkw_KeywordOf<oif_FixedMassScaling>, private oif_MassScaling {
public:
    oif_FixedMassScaling(const kprC_MassScaling& scaling, const cow_String& setName)
        : oif_MassScaling(scaling, setName) {}
    void Write(utl_Stream& stream) const override;
};

/// Mass scaling throughout a step: semi-automatic as above, its end, or that of a rolled piece:
///     ** Mass Scaling: Automatic
///     **               SET
///     *Variable Mass Scaling, elset=SET, type=rolling, feed rate=10.,
///     extruded length=0.1, cross section=12, direction=1, number interval=5
/// Another kind writes an empty line. A rolling direction that is none raises.
class oif_VariableMassScaling final : public qkw_KeywordOf<oif_VariableMassScaling>, private oif_MassScaling {
public:
    oif_VariableMassScaling(const kprC_MassScaling& scaling, const cow_String& setName)
        : oif_MassScaling(scaling, setName) {}
    void Write(utl_Stream& stream) const override;

private:
    void WriteRolling(utl_Stream& stream) const;
};

#endif
