#ifndef QRX_OIF_BEAMSECTIONS_H
#define QRX_OIF_BEAMSECTIONS_H

#include "foundation/gsl_Geometry.h"
#include "keyword_layer/qkw_Keyword.h"
#include "store_interface/records/sections/kbpC_BeamProfile.h"
#include "store_interface/records/sections/kseC_BeamSection.h"

/// What the two beam keywords share: profile, orientation of the cross-section and fluid inertia. Nothing is
/// written for a section that is no beam's. The set's name is given in the form that the deck has it in.
class oif_BeamSectionCommon : public mem_AllocationOperators {
protected:
    oif_BeamSectionCommon(const char* keyword, const cow_String& setName,
                          const mdl_ObjCow<kseC_Section>& section, const gsl_Vector& direction,
                          const mdl_ObjCow<kbpC_BeamProfile>& profile)
        : keyword_(keyword), setName_(setName), section_(section), direction_(direction), profile_(profile) {}
    oif_BeamSectionCommon(const oif_BeamSectionCommon&) = default;
    oif_BeamSectionCommon& operator=(const oif_BeamSectionCommon&) = default;
    virtual ~oif_BeamSectionCommon() = default;

    void WriteData(utl_Stream& stream) const;

    virtual void WriteGeneralizedProfile(utl_Stream& stream, const kbpC_GeneralizedProfile& profile) const;
    virtual void WriteDensity(utl_Stream&, const kseC_BeamSection&) const {}
    virtual void WriteOptions(utl_Stream&, const kseC_BeamSection&) const {}
    virtual void WriteTempData(utl_Stream& stream, const kseC_BeamSection& section) const = 0;
    virtual void WriteMaterialBehavior(utl_Stream& stream, const kseC_BeamSection& section) const = 0;

private:
    void WriteProfile(utl_Stream& stream) const;

    const char* keyword_;
    cow_String setName_;
    mdl_ObjCow<kseC_Section> section_;
    gsl_Vector direction_;
    mdl_ObjCow<kbpC_BeamProfile> profile_;
};

/// Beam elements, integrated over their cross-section during the analysis:
///     *Beam Section, elset=SET, material=Steel, temperature=GRADIENTS, section=RECT
///     0.1, 0.2
///     0.,0.,-1.
class oif_BeamSection final : public qkw_KeywordOf<oif_BeamSection>, private oif_BeamSectionCommon {
public:
    /// `direction`: the first axis of the cross-section.
    oif_BeamSection(const cow_String& setName, const mdl_ObjCow<kseC_Section>& section,
                    const gsl_Vector& direction, const mdl_ObjCow<kbpC_BeamProfile>& profile)
        : oif_BeamSectionCommon("*Beam Section", setName, section, direction, profile) {}
    void Write(utl_Stream& stream) const override { WriteData(stream); }

private:
    void WriteTempData(utl_Stream& stream, const kseC_BeamSection& section) const override;
    void WriteMaterialBehavior(utl_Stream& stream, const kseC_BeamSection& section) const override;
};

/// Beam elements of given stiffness, with their material constants, damping and points for output:
///     *Beam General Section, elset=SET, poisson = 0.3, density=7800., section=GENERAL
///     1., 2., 0., 3., 4.
///     0.,0.,-1.
///     210000.,80000.
class oif_BeamGeneralSection final : public qkw_KeywordOf<oif_BeamGeneralSection>,
                                     private oif_BeamSectionCommon {
public:
    /// `direction`: the first axis of the cross-section.
    oif_BeamGeneralSection(const cow_String& setName, const mdl_ObjCow<kseC_Section>& section,
                           const gsl_Vector& direction, const mdl_ObjCow<kbpC_BeamProfile>& profile)
        : oif_BeamSectionCommon("*Beam General Section", setName, section, direction, profile) {}
    void Write(utl_Stream& stream) const override { WriteData(stream); }

private:
    void WriteGeneralizedProfile(utl_Stream& stream, const kbpC_GeneralizedProfile& profile) const override;
    void WriteDensity(utl_Stream& stream, const kseC_BeamSection& section) const override;
    void WriteOptions(utl_Stream& stream, const kseC_BeamSection& section) const override;
    void WriteTempData(utl_Stream& stream, const kseC_BeamSection& section) const override;
    void WriteMaterialBehavior(utl_Stream& stream, const kseC_BeamSection& section) const override;
};

#endif
