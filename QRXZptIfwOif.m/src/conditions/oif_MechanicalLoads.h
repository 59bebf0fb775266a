#ifndef QRX_OIF_MECHANICALLOADS_H
#define QRX_OIF_MECHANICALLOADS_H

#include "base/oif_KeywordLine.h"
#include "conditions/oif_Card.h"
#include "conditions/oif_LoadTable.h"
#include "keyword_layer/qkw_Keyword.h"
#include "store_interface/records/conditions/kloC_BoltLoad.h"
#include "store_interface/records/conditions/kloC_Loads.h"

#include <vector>

using oif_Labels = std::span<const char* const>;

/// What the mechanical load keywords share. In the add-and-change mode a real load writes what was set in
/// the step, under op=NEW also what is carried over; a changed amplitude writes everything. A complex load
/// has one block for its real parts and one for its imaginary parts, without the values that are 0. A load
/// that ends writes its keyword line alone.
class oif_MechanicalLoad : public qkw_Keyword {
protected:
    /// Whether an amplitude that was taken away counts as a change.
    enum class ClearedAmplitude { IGNORED, COUNTS };

    oif_MechanicalLoad(const oif_LoadCard& card, ClearedAmplitude clearedAmplitude);

    bool Passes(mdl_PropAttributeStateEnm state) const;
    /// The whole line of a keyword without parameters of its own.
    void WriteCard(utl_Stream& stream, const char* keyword, int loadCase, bool follower = false) const;
    void BeginLine(utl_Stream& stream, const cow_String& label, const char* separator = ", ") const;
    void WriteLine(utl_Stream& stream, const cow_String& label, double value) const;

    /// One block, or one for each part, of a line for each label. `card(part)` writes the keyword line; part
    /// 0 is the real load, 1 and 2 are the real and the imaginary parts of a complex one.
    template <class Card>
    void WriteComponents(utl_Stream& stream, oif_Labels labels, const char* suffix, const Card& card) const;
    /// The same of one value. `block(part, value)` writes keyword and data.
    template <class Block>
    void WriteMagnitude(bool passes, const Block& block) const;

    cow_String setName_;
    cow_String amplitude_;
    oif_Op op_;
    double scale_;
    bool deactivated_ = false;
    bool modifiedOnly_;
    bool complex_;
    std::vector<kloC_LoadValue> values_;
};

/// Loads at nodes: forces, moments, bolt forces, flow of pore fluid, volume acceleration:
///     *Cload, op=NEW, follower, amplitude=Amp-1
///     Set-1, 1, 100.
/// A complex load has two of it, with ", load case=1" and ", load case=2". A bolt that is held by its length
/// has the keyword line alone. Writing another load, or a complex flow of pore fluid, raises.
class oif_Cload final : public qkw_KeywordOf<oif_Cload, oif_MechanicalLoad> {
public:
    static constexpr const char* ComplexPoreFluid = "\"Concentrated pore fluid load cannot be complex\" == 0";

    oif_Cload(const oif_LoadCard& card, const kloC_ConcentratedForce& force);
    oif_Cload(const oif_LoadCard& card, const kloC_Moment& moment);
    oif_Cload(const oif_LoadCard& card, const kloC_PEGLoad& load);
    oif_Cload(const oif_LoadCard& card, const kloC_BoltLoad& bolt);
    oif_Cload(const oif_LoadCard& card, const kloC_ConcentratedPoreFluid& flow);
    oif_Cload(const oif_LoadCard& card, const kloC_InwardVolAccel& acceleration);
    oif_Cload(const oif_LoadCard& card, const kloC_Load& other);
    void Write(utl_Stream& stream) const override;

    /// Whether writing the load raises ComplexPoreFluid unless it ends.
    static bool IsComplexPoreFluid(const kloC_Load& load);

private:
    oif_Cload(const oif_LoadCard& card, oif_Labels labels, bool follower = false);
    void WriteCloadCard(utl_Stream& stream, int loadCase, bool follower) const;
    void WriteSingle(utl_Stream& stream, const char* label) const;

    oif_Labels labels_; // of the components, or of the one magnitude
    bool follower_;
    bool bolted_ = false; // held by its length
    const char* failure_ = nullptr;
};

/// Forces and moments in the relative motions of connectors:
///     *Connector Load, amplitude=Amp-1
///     Set-1, 4, 100.
/// Writing another load raises.
class oif_ConnectorLoad final : public qkw_KeywordOf<oif_ConnectorLoad, oif_MechanicalLoad> {
public:
    oif_ConnectorLoad(const oif_LoadCard& card, const kloC_ConnectorForce& force);
    oif_ConnectorLoad(const oif_LoadCard& card, const kloC_ConnectorMoment& moment);
    oif_ConnectorLoad(const oif_LoadCard& card, const kloC_Load& other);
    void Write(utl_Stream& stream) const override;

private:
    oif_ConnectorLoad(const oif_LoadCard& card, oif_Labels labels);

    oif_Labels labels_;
};

/// Loads on lines and volumes:
///     *Dload
///     Set-1, GRAV, 9.81, 0., 0., -1.
/// Writing another load raises.
class oif_Dload final : public qkw_KeywordOf<oif_Dload, oif_MechanicalLoad> {
public:
    oif_Dload(const oif_LoadCard& card, const kloC_RotationalBodyForce& rotation,
              const oif_LoadSetting& setting);
    oif_Dload(const oif_LoadCard& card, const kloC_LineLoad& load, const oif_LoadSetting& setting);
    oif_Dload(const oif_LoadCard& card, const kloC_PipePressure& pipe, const oif_LoadSetting& setting);
    oif_Dload(const oif_LoadCard& card, const kloC_BodyForce& force, const oif_LoadSetting& setting);
    oif_Dload(const oif_LoadCard& card, const kloC_Gravity& gravity, const oif_LoadSetting& setting);
    oif_Dload(const oif_LoadCard& card, const kloC_Load& other, const oif_LoadSetting& setting);
    void Write(utl_Stream& stream) const override;

private:
    using Form = void (oif_Dload::*)(utl_Stream& stream) const;

    oif_Dload(const oif_LoadCard& card, const oif_LoadSetting& setting, Form form);
    void WriteDloadCard(utl_Stream& stream, int loadCase) const;
    void WriteVector(utl_Stream& stream) const;
    void WriteGravity(utl_Stream& stream) const;
    void WritePipePressure(utl_Stream& stream) const;
    void WriteRotation(utl_Stream& stream) const;
    void WritePipePressureData(utl_Stream& stream) const;
    void WriteRotBodyForceData(utl_Stream& stream, double magnitude) const;

    Form form_; // null for another load
    int space_;
    oif_Labels labels_;       // of the components
    cow_String label_;        // of the one magnitude
    const char* suffix_ = ""; // of user-defined loads
    bool hydrostatic_ = false;
    double heights_[2] = {0.0, 0.0};
    bool heightsPass_ = false;
    double diameter_ = 0.0;
    gsl_ModelSegment axis_;
};

/// Loads on surfaces and shell edges:
///     *Dsload, op=NEW, amplitude=Amp-1, cyclic mode=2, follower=NO, orientation=Csys-1
///     Surf-1, TRVEC, 100., 1., 0., 0.
/// An empty set name raises. Writing another load raises; one that ends is written.
class oif_Dsload final : public qkw_KeywordOf<oif_Dsload, oif_MechanicalLoad> {
public:
    /// The text of an assertion is the message.
    static constexpr const char* EmptySetName = "! setName.Empty()";

    oif_Dsload(const oif_LoadCard& card, const kloC_Pressure& pressure, const oif_LoadSetting& setting);
    oif_Dsload(const oif_LoadCard& card, const kloC_SurfaceTraction& traction,
               const oif_LoadSetting& setting);
    oif_Dsload(const oif_LoadCard& card, const kloC_ShellEdgeLoad& load, const oif_LoadSetting& setting);
    oif_Dsload(const oif_LoadCard& card, const kloC_SubmodelStressBased& load,
               const oif_LoadSetting& setting);
    oif_Dsload(const oif_LoadCard& card, const kloC_Load& other, const oif_LoadSetting& setting);
    void Write(utl_Stream& stream) const override;

private:
    using Form = void (oif_Dsload::*)(utl_Stream& stream) const;

    oif_Dsload(const oif_LoadCard& card, const oif_LoadSetting& setting, Form form);
    void TakeTraction(const kloC_Traction& traction, const cow_String& name, const oif_LoadSetting& setting);
    void WriteDsloadCard(utl_Stream& stream, int loadCase, bool followerNo, bool constantResultant,
                         const cow_String& orientation) const;
    void WritePressure(utl_Stream& stream) const;
    void WriteTraction(utl_Stream& stream) const;
    void WriteHydrostaticData(utl_Stream& stream) const;
    void WriteDirectionVectorData(utl_Stream& stream) const;

    Form form_; // null for another load
    cow_String label_;
    bool hydrostatic_ = false;
    double heights_[2] = {0.0, 0.0};
    bool heightsPass_ = false;
    bool vectorGiven_ = false;
    bool followerNo_ = false;
    bool constantResultant_ = false;
    gsl_Vector direction_;
    cow_String orientation_;
    bool isSubmodel_ = false;
    double scaleParameter_ = 1.0;
    cow_String refNode_;
    cow_String submodelStep_;
    std::optional<int> cyclicMode_;
};

#endif
