#ifndef QRX_OIF_MECHANICALLOADS_H
#define QRX_OIF_MECHANICALLOADS_H

#include "keyword_layer/qkw_Keyword.h"
#include "keyword_layer/qkw_ModelInfo.h"
#include "store_interface/records/conditions/kloC_Load.h"

#include <span>
#include <vector>

/// What the mechanical load keywords share. In the add-and-change mode a real load writes what was set in
/// the step, under op=NEW also what is carried over; a changed amplitude writes everything. A complex load
/// has one block for its real parts and one for its imaginary parts, without the values that are 0. A load
/// that ends writes its keyword line alone.
class oif_MechanicalLoad : public qkw_Keyword {
protected:
    /// Whether an amplitude that was taken away counts as a change.
    enum class ClearedAmplitude { IGNORED, COUNTS };

    oif_MechanicalLoad(const kloC_Load& load, const cow_String& stepName, bool opMod,
                       const cow_String& setName, double scale, ClearedAmplitude clearedAmplitude);

    bool Passes(mdl_PropAttributeStateEnm state) const;
    void WriteOpNew(utl_Stream& stream) const;
    void WriteAmplitude(utl_Stream& stream) const;
    static void WriteLoadCase(utl_Stream& stream, int loadCase);
    /// The whole line of a keyword without parameters of its own.
    void WriteCard(utl_Stream& stream, const char* keyword, int loadCase, bool follower = false) const;
    void BeginLine(utl_Stream& stream, const cow_String& label, const char* separator = ", ") const;
    void WriteLine(utl_Stream& stream, const cow_String& label, double value) const;

    /// One block, or one for each part, of a line for each label. `card(part)` writes the keyword line; part
    /// 0 is the real load, 1 and 2 are the real and the imaginary parts of a complex one.
    template <class Card>
    void WriteComponents(utl_Stream& stream, std::span<const char* const> labels, const char* suffix,
                         const Card& card) const;
    /// The same of one value. `block(part, value)` writes keyword and data.
    template <class Block>
    void WriteMagnitude(bool passes, const Block& block) const;

    unsigned typeId_;
    cow_String setName_;
    cow_String amplitude_;
    bool opNew_;
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
    oif_Cload(const kloC_Load& load, const cow_String& stepName, bool opMod, const qkw_ModelInfo& modelInfo,
              const cow_String& name, double scale);
    /// With the name of the load's region, for many keywords of one load to share.
    oif_Cload(const kloC_Load& load, const cow_String& stepName, bool opMod, const cow_String& regionName,
              double scale);
    void Write(utl_Stream& stream) const override;

private:
    void WriteCloadCard(utl_Stream& stream, int loadCase, bool follower) const;
    void WriteSingle(utl_Stream& stream, const cow_String& label) const;

    bool follower_ = false;
    bool bolted_ = false; // held by its length
};

/// Forces and moments in the relative motions of connectors:
///     *Connector Load, amplitude=Amp-1
///     Set-1, 4, 100.
/// Writing another load raises.
class oif_ConnectorLoad final : public qkw_KeywordOf<oif_ConnectorLoad, oif_MechanicalLoad> {
public:
    oif_ConnectorLoad(const kloC_Load& load, const cow_String& setName, const cow_String& stepName,
                      bool opMod, double scale);
    void Write(utl_Stream& stream) const override;
};

/// Loads on lines and volumes:
///     *Dload
///     Set-1, GRAV, 9.81, 0., 0., -1.
/// Writing another load raises.
class oif_Dload final : public qkw_KeywordOf<oif_Dload, oif_MechanicalLoad> {
public:
    /// `space` is 1 in three dimensions, 4 for an axisymmetric model. The cyclic mode and the last text
    /// reach no line.
    oif_Dload(const kloC_Load& load, const cow_String& stepName, bool opMod, const cow_String& setName,
              int space, const qkw_ModelInfo& modelInfo, bool cyclicApplies, int cyclicMode, double scale,
              const cow_String& extraName);
    void Write(utl_Stream& stream) const override;

private:
    void WriteDloadCard(utl_Stream& stream, int loadCase) const;
    void WriteLineLoad(utl_Stream& stream) const;
    void WriteBodyForce(utl_Stream& stream) const;
    void WriteGravity(utl_Stream& stream) const;
    void WritePipePressureData(utl_Stream& stream) const;
    void WriteRotBodyForceData(utl_Stream& stream, double magnitude) const;

    int space_;
    cow_String label_;
    const char* suffix_ = ""; // of user-defined loads
    bool local_ = false;      // a line load along the axes of the section
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
    oif_Dsload(const kloC_Load& load, const cow_String& stepName, bool opMod, const cow_String& setName,
               const qkw_ModelInfo& modelInfo, bool cyclicApplies, int cyclicMode, double scale,
               const cow_String& refNode, const cow_String& name);
    void Write(utl_Stream& stream) const override;

private:
    void WriteDsloadCard(utl_Stream& stream, int loadCase, bool followerNo, bool constantResultant,
                         const cow_String& orientation) const;
    void WritePressure(utl_Stream& stream) const;
    void WriteTraction(utl_Stream& stream) const;
    void WriteHydrostaticData(utl_Stream& stream) const;
    void WriteDirectionVectorData(utl_Stream& stream) const;

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
    bool cyclicApplies_;
    int cyclicMode_;
};

#endif
