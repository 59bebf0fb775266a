#ifndef QRX_OIF_CONNECTOROPTIONS_H
#define QRX_OIF_CONNECTOROPTIONS_H

#include "keyword_layer/qkw_Keyword.h"
#include "keyword_layer/qkw_ModelInfo.h"
#include "store_interface/records/sections/kbeC_ConnectorBehavior.h"

// The options of a connector's behaviour. Where one names components, it writes its keyword once for each.
//     *Connector Elasticity, component=1, dependencies=1, regularize=ON, rtol=0.03
//     data lines
void oif_WriteConnectorOption(utl_Stream& stream, const kbeC_ConnectorElasticity& option);
void oif_WriteConnectorOption(utl_Stream& stream, const kbeC_ConnectorDamping& option);
void oif_WriteConnectorOption(utl_Stream& stream, const kbeC_ConnectorStop& option);
void oif_WriteConnectorOption(utl_Stream& stream, const kbeC_ConnectorLock& option);
void oif_WriteConnectorOption(utl_Stream& stream, const kbeC_ConnectorFailure& option);

/// The keyword of options of class R.
template <class R>
class oif_ConnectorOption final : public qkw_KeywordOf<oif_ConnectorOption<R>> {
public:
    explicit oif_ConnectorOption(const R& option) : option_(option) {}
    void Write(utl_Stream& stream) const override { oif_WriteConnectorOption(stream, option_); }

private:
    R option_;
};
using oif_ConnectorElasticity = oif_ConnectorOption<kbeC_ConnectorElasticity>;
using oif_ConnectorDamping = oif_ConnectorOption<kbeC_ConnectorDamping>;
using oif_ConnectorStop = oif_ConnectorOption<kbeC_ConnectorStop>;
using oif_ConnectorLock = oif_ConnectorOption<kbeC_ConnectorLock>;
using oif_ConnectorFailure = oif_ConnectorOption<kbeC_ConnectorFailure>;

/// Derived components by their generated names.
using oif_DerivedComponents = mdl_MapString2ObjCow<kbeC_DerivedComponent>;

/// Friction, with the friction coefficient and the potential behind it:
///     *Connector Friction, component=1, contact force=BO-2-DC, independent components=POSITION
///     data lines
///     *Friction
///     data lines
///     *Connector Potential, exponent=3.
///     BO-2-CP-0, 1., 1., ABS, 2., 1.0
class oif_ConnectorFriction final : public qkw_KeywordOf<oif_ConnectorFriction> {
public:
    /// `index` is the option's place in its behaviour, from 0; it goes into generated names.
    oif_ConnectorFriction(const kbeC_ConnectorFriction& option, const qkw_ModelInfo& modelInfo, int index)
        : option_(option), index_(index), product_(modelInfo.AnalysisProduct()) {}
    void Write(utl_Stream& stream) const override;
    /// Adds those that the option refers to.
    void GetDerivedComponents(oif_DerivedComponents& components) const;

private:
    void WriteTangentialBehavior(utl_Stream& stream) const;

    kbeC_ConnectorFriction option_;
    int index_;
    kprC_AnalysisProductEnm product_;
};

/// Plasticity with its hardenings, and behind all the potential:
///     *Connector Plasticity, component=1
///     *Connector Hardening, definition=Tabular
///     data lines
///     *Connector Hardening, type=Kinematic, definition=Half Cycle
///     data lines
class oif_ConnectorPlasticity final : public qkw_KeywordOf<oif_ConnectorPlasticity> {
public:
    oif_ConnectorPlasticity(const kbeC_ConnectorPlasticity& option, int index)
        : option_(option), index_(index) {}
    void Write(utl_Stream& stream) const override;
    void GetDerivedComponents(oif_DerivedComponents& components) const;

private:
    kbeC_ConnectorPlasticity option_;
    int index_;
};

/// Initiation and evolution of damage, each with its potential:
///     *Connector Damage Initiation, component=1, criterion=Motion
///     data lines
///     *Connector Damage Evolution, type=Motion, softening=Tabular
///     data lines
class oif_ConnectorDamage final : public qkw_KeywordOf<oif_ConnectorDamage> {
public:
    oif_ConnectorDamage(const kbeC_ConnectorDamage& option, int index) : option_(option), index_(index) {}
    void Write(utl_Stream& stream) const override;
    void GetDerivedComponents(oif_DerivedComponents& components) const;

private:
    void WriteEvolution(utl_Stream& stream) const;

    kbeC_ConnectorDamage option_;
    int index_;
};

/// A derived component, one keyword for each term:
///     *Connector Derived Component, name=BO-0-CP-1, operator=SUM
///     components
///     data lines
class oif_DerivedComponent final : public qkw_KeywordOf<oif_DerivedComponent> {
public:
    oif_DerivedComponent(const cow_String& name, const kbeC_DerivedComponent& component)
        : name_(name), component_(component) {}
    void Write(utl_Stream& stream) const override;

private:
    cow_String name_;
    kbeC_DerivedComponent component_;
};

#endif
