#ifndef QRX_OIF_FLUXLOADS_H
#define QRX_OIF_FLUXLOADS_H

#include "conditions/oif_Card.h"
#include "keyword_layer/qkw_Keyword.h"

/// The texts of a keyword of thermal and flow loads. Where there is no label, the load's degree of freedom
/// takes its place.
struct oif_FluxText {
    const char* keyword;
    const char* label;     ///< with the separators around it
    const char* userLabel; ///< the same for a user-defined distribution
};

/// What these keywords share. Their one magnitude is written whatever its state, and never scaled.
class oif_FluxLoad : public qkw_Keyword {
protected:
    explicit oif_FluxLoad(const oif_LoadCard& card);
    void WriteAs(const oif_FluxText& text, utl_Stream& stream) const;

private:
    oif_Op op_;
    cow_String setName_;
    cow_String amplitude_;
    double magnitude_ = 0.0;
    int selector_;
    bool deactivated_;
};

/// A load of the thermal and flow group, such as
///     *Dsflux, op=NEW, amplitude=Amp-1
///     Surf-1, S, 100.
/// A load that ends has its keyword line alone.
template <const oif_FluxText& Text>
class oif_FluxLoadOf final : public qkw_KeywordOf<oif_FluxLoadOf<Text>, oif_FluxLoad> {
public:
    explicit oif_FluxLoadOf(const oif_LoadCard& card)
        : qkw_KeywordOf<oif_FluxLoadOf<Text>, oif_FluxLoad>(card) {}
    void Write(utl_Stream& stream) const override { oif_FluxLoad::WriteAs(Text, stream); }
};

inline constexpr oif_FluxText oif_CfluxText{"*Cflux", nullptr, nullptr};
inline constexpr oif_FluxText oif_DfluxText{"*Dflux", ", BF, ", ", BFNU, "};
inline constexpr oif_FluxText oif_DsfluxText{"*Dsflux", ", S, ", ", SNU, "};
inline constexpr oif_FluxText oif_DsflowText{"*Dsflow", ", S, ", ", SNU, "};
inline constexpr oif_FluxText oif_FluidFluxText{"*Fluid Flux", ", ", ", "};

using oif_Cflux = oif_FluxLoadOf<oif_CfluxText>;         ///< heat and concentration fluxes at nodes
using oif_Dflux = oif_FluxLoadOf<oif_DfluxText>;         ///< the same in volumes
using oif_Dsflux = oif_FluxLoadOf<oif_DsfluxText>;       ///< the same on surfaces
using oif_Dsflow = oif_FluxLoadOf<oif_DsflowText>;       ///< pore fluid through surfaces
using oif_FluidFlux = oif_FluxLoadOf<oif_FluidFluxText>; ///< flow into fluid cavities

/// The texts of a keyword of electrical loads.
struct oif_ElectricalText {
    const char* keyword;
    const char* label; ///< with the separators around it
};

/// What the electrical keywords share: one magnitude, or its two parts, never scaled.
class oif_ElectricalLoad : public qkw_Keyword {
protected:
    explicit oif_ElectricalLoad(const oif_LoadCard& card);
    void WriteAs(const oif_ElectricalText& text, utl_Stream& stream) const;

private:
    void WriteCard(utl_Stream& stream, const oif_ElectricalText& text, int loadCase) const;

    double real_ = 0.0;
    double imag_ = 0.0;
    mdl_PropAttributeStateEnm magnitudeState_ = mdl_PropAttributeStateEnm::NEVER_SET;
    cow_String amplitude_;
    cow_String setName_;
    bool complex_;
    oif_Op op_;
    bool deactivated_;
    bool writeAlways_;
};

/// A load of the electrical group, such as
///     *Dsecharge, op=NEW, amplitude=Amp-1
///     Surf-1,ES,100.
/// A complex one has two of it, with ", load case=1" and ", load case=2". A load that ends has its keyword
/// line alone.
template <const oif_ElectricalText& Text>
class oif_ElectricalLoadOf final : public qkw_KeywordOf<oif_ElectricalLoadOf<Text>, oif_ElectricalLoad> {
public:
    explicit oif_ElectricalLoadOf(const oif_LoadCard& card)
        : qkw_KeywordOf<oif_ElectricalLoadOf<Text>, oif_ElectricalLoad>(card) {}
    void Write(utl_Stream& stream) const override { oif_ElectricalLoad::WriteAs(Text, stream); }
};

inline constexpr oif_ElectricalText oif_CechargeText{"*Cecharge", ", ,"};
inline constexpr oif_ElectricalText oif_CecurrentText{"*Cecurrent", ", ,"};
inline constexpr oif_ElectricalText oif_DechargeText{"*Decharge", ",EBF,"};
inline constexpr oif_ElectricalText oif_DecurrentText{"*Decurrent", ",CBF,"};
inline constexpr oif_ElectricalText oif_DsechargeText{"*Dsecharge", ",ES,"};
inline constexpr oif_ElectricalText oif_DsecurrentText{"*Dsecurrent", ",CS,"};

using oif_Cecharge = oif_ElectricalLoadOf<oif_CechargeText>;
using oif_Cecurrent = oif_ElectricalLoadOf<oif_CecurrentText>;
using oif_Decharge = oif_ElectricalLoadOf<oif_DechargeText>;
using oif_Decurrent = oif_ElectricalLoadOf<oif_DecurrentText>;
using oif_Dsecharge = oif_ElectricalLoadOf<oif_DsechargeText>;
using oif_Dsecurrent = oif_ElectricalLoadOf<oif_DsecurrentText>;

#endif
