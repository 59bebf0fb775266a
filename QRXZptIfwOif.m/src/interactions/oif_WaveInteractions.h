#ifndef QRX_OIF_WAVEINTERACTIONS_H
#define QRX_OIF_WAVEINTERACTIONS_H

#include "interactions/oif_StepInteraction.h"
#include "store_interface/records/interactions/kinC_WaveInteractions.h"

/// An acoustic boundary, by a property or nonreflecting:
///     *Simpedance, property=Imp-1, op=NEW
///     Inst.SURFACE
///     *Simpedance, nonreflecting=CIRCULAR
///     Inst.SURFACE, 2.5
class oif_AcousticImpedance final : public qkw_KeywordOf<oif_AcousticImpedance, oif_StepInteraction> {
public:
    using qkw_KeywordOf::qkw_KeywordOf;

private:
    const char* Keyword() const override { return "*Simpedance"; }
    void AddParameters(oif_KeywordLine& line) const override;
    void WriteData(utl_Stream& stream) const override;
};

/// Impedances or admittances as a table:
///     *Impedance Property, name=Imp-1, data=IMPEDANCE
///     1., 0.5, 10.
class oif_AcousticImpedanceProp final : public qkw_KeywordOf<oif_AcousticImpedanceProp> {
public:
    /// A property of another class raises.
    oif_AcousticImpedanceProp(const cow_String& name, const kinC_InteractionProperty& property);
    void Write(utl_Stream& stream) const override;

private:
    cow_String name_;
    kinC_AcousticImpedanceProp property_;
};

/// A wave from outside; only in the step that begins it:
///     *Incident wave interaction, pressure amplitude=Amp-1, property=Wave-1
///     Inst.SURFACE, Inst.SOURCE, Inst.STANDOFF, 1.
class oif_IncidentWave final : public qkw_KeywordOf<oif_IncidentWave> {
public:
    /// An interaction of another class raises.
    oif_IncidentWave(const kinC_Interaction& interaction, const cow_String& step,
                     const cow_String& sourceName, const cow_String& standoffName,
                     const cow_String& surfaceName);
    void Write(utl_Stream& stream) const override;

private:
    kinC_IncidentWave wave_;
    cow_String step_;
    cow_String sourceName_;
    cow_String standoffName_;
    cow_String surfaceName_;
};

/// How an incident wave travels; for callers of the library, no deck gets it:
///     *Incident Wave Interaction Property, name=Wave-1, type=SPHERE
///     1500., 1000.
class oif_IncidentWaveProperty final : public qkw_KeywordOf<oif_IncidentWaveProperty> {
public:
    /// A property of another class raises.
    oif_IncidentWaveProperty(const cow_String& name, const kinC_InteractionProperty& property);
    /// Where the charge of an underwater explosion lies: in place of the record's depth, and the direction
    /// of the surface's normal, which is zero without this.
    void setDepthNormal(double depth, const gsl_ModelSegment& normal) {
        depth_ = depth;
        normal_ = normal;
    }
    void Write(utl_Stream& stream) const override;

private:
    void WriteCharge(utl_Stream& stream) const;

    cow_String name_;
    kinC_IncidentWaveProperty property_;
    double depth_;
    gsl_ModelSegment normal_;
};

#endif
