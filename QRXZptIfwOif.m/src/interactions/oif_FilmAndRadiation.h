#ifndef QRX_OIF_FILMANDRADIATION_H
#define QRX_OIF_FILMANDRADIATION_H

#include "interactions/oif_StepInteraction.h"
#include "keyword_layer/qkw_ModelInfo.h"
#include "store_interface/records/interactions/kinC_FilmAndRadiation.h"

/// What the two film keywords share.
class oif_FilmInteraction : public oif_StepInteraction {
protected:
    using oif_StepInteraction::oif_StepInteraction;
    void AddFilmAmplitudes(oif_KeywordLine& line) const;
};

/// Convection at a surface:
///     *Sfilm, amplitude=Amp-1, op=NEW
///     Inst.SURFACE, F, 20., 0.5
class oif_Sfilm final : public qkw_KeywordOf<oif_Sfilm, oif_FilmInteraction> {
public:
    using qkw_KeywordOf::qkw_KeywordOf;

private:
    const char* Keyword() const override { return "*Sfilm"; }
    void AddParameters(oif_KeywordLine& line) const override;
    void WriteData(utl_Stream& stream) const override;
};

/// Convection at nodes; the area of a node comes first:
///     *Cfilm, region type=SLIDING
///     Inst.NODES, 1., 20., 0.5
class oif_Cfilm final : public qkw_KeywordOf<oif_Cfilm, oif_FilmInteraction> {
public:
    using qkw_KeywordOf::qkw_KeywordOf;

private:
    const char* Keyword() const override { return "*Cfilm"; }
    void AddParameters(oif_KeywordLine& line) const override;
    void WriteData(utl_Stream& stream) const override;
};

/// Radiation from a surface:
///     *Sradiate, amplitude=Amp-1
///     Inst.SURFACE, R, 20., 0.8
class oif_Sradiate final : public qkw_KeywordOf<oif_Sradiate, oif_StepInteraction> {
public:
    using qkw_KeywordOf::qkw_KeywordOf;

private:
    const char* Keyword() const override { return "*Sradiate"; }
    void AddParameters(oif_KeywordLine& line) const override;
    void WriteData(utl_Stream& stream) const override;
};

/// Radiation from nodes; the area of a node comes first:
///     *Cradiate, region type=EULERIAN
///     Inst.NODES, 1., 20., 0.8
class oif_Cradiate final : public qkw_KeywordOf<oif_Cradiate, oif_StepInteraction> {
public:
    using qkw_KeywordOf::qkw_KeywordOf;

private:
    const char* Keyword() const override { return "*Cradiate"; }
    void AddParameters(oif_KeywordLine& line) const override;
    void WriteData(utl_Stream& stream) const override;
};

/// Film coefficients as a table, eight values a line:
///     *Film Property, name=Film-1, dependencies=1
///     0.5, 20., 1.
class oif_FilmProperty final : public qkw_KeywordOf<oif_FilmProperty> {
public:
    /// A property of another class raises.
    oif_FilmProperty(const cow_String& name, const kinC_InteractionProperty& property);
    void Write(utl_Stream& stream) const override;

private:
    cow_String name_;
    kinC_FilmConditionProp property_;
};

/// The surfaces of a cavity:
///     *Cavity Definition, name=Cavity-1, ambient temp=20.
///     Inst.SURFACE
class oif_CavityDefinition final : public qkw_KeywordOf<oif_CavityDefinition> {
public:
    /// An interaction of another class raises.
    oif_CavityDefinition(const cow_String& name, const kinC_Interaction& interaction,
                         const qkw_ModelInfo& modelInfo);
    void Write(utl_Stream& stream) const override;

private:
    cow_String name_;
    double ambientTemp_;
    cow_List<cow_String> surfaces_;
};

/// How the view factors of a cavity are computed in a step; or that it does not radiate there:
///     *Radiation Viewfactor, cavity=Cavity-1, blocking=ALL, reflection=YES, vtol=0.05
///     *Radiation Viewfactor, cavity=Cavity-1, off
class oif_RadiationViewfactor final : public qkw_KeywordOf<oif_RadiationViewfactor> {
public:
    oif_RadiationViewfactor(const cow_String& name, const kinC_CavityRadiation& cavity,
                            const cow_String& step, const qkw_ModelInfo& modelInfo);
    void SwitchOff() { off_ = true; }
    void Write(utl_Stream& stream) const override;

private:
    cow_String name_;
    kinC_CavityRadiationState state_;
    cow_List<cow_String> blockingSurfaces_;
    bool off_ = false;
};

#endif
