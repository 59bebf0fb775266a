#ifndef QRX_OIF_SOLIDSECTIONS_H
#define QRX_OIF_SOLIDSECTIONS_H

#include "sections/oif_SectionKeyword.h"
#include "store_interface/records/sections/kseC_SolidSections.h"

/// Continuum or truss elements:
///     *Solid Section, elset=SET, orientation=Ori-1, controls=EC-1, material=Steel
///     1.,
///     *Solid Section, elset=SET, composite
///     0.5, 3, Steel, 45
/// A truss has neither orientation nor controls, whatever was given. A section of another kind raises
/// "Neither solid nor truss section type" before anything is written; a solid that is neither homogeneous
/// nor composite raises "Unknown solid section type" behind the parameters.
class oif_SolidSection final : public oif_SectionKeywordOf<oif_SolidSection> {
public:
    using oif_SectionKeywordOf::oif_SectionKeywordOf;
    void Write(utl_Stream& stream) const override;

private:
    oif_KeywordLine KeywordLine(utl_Stream& stream) const;
    void WriteTruss(utl_Stream& stream, const kseC_TrussSection& truss) const;
    void WriteHomogeneous(utl_Stream& stream, const kseC_HomogenousSolidSection& solid) const;
    void WriteComposite(utl_Stream& stream, const kseC_CompositeSolidSection& solid) const;
};

/// Membrane elements:
///     *Membrane Section, elset=SET, material=Rubber, orientation=Ori-1, controls=EC-1, poisson=0.4
///     0.1,
class oif_MembraneSection final : public oif_SectionKeywordOf<oif_MembraneSection> {
public:
    using oif_SectionKeywordOf::oif_SectionKeywordOf;
    void Write(utl_Stream& stream) const override;
};

/// Gasket elements; initial thickness, gap, void and cross-section on the line:
///     *Gasket Section, elset=SET, behavior=Seal, orientation=Ori-1, stabilization stiffness=1000.
///     2., 0., 0., 1.
/// Nothing for a section of another kind.
class oif_GasketSection final : public oif_SectionKeywordOf<oif_GasketSection> {
public:
    /// `isBehavior`: the material is a gasket behaviour and is named as one.
    oif_GasketSection(const cow_String& setName, const mdl_ObjCow<kseC_Section>& section, bool isBehavior,
                      const cow_String& orientationName)
        : oif_SectionKeywordOf(setName, section, orientationName, {}), isBehavior_(isBehavior) {}
    void Write(utl_Stream& stream) const override;

private:
    bool isBehavior_;
};

#endif
