#ifndef QRX_OIF_SHELLSECTIONS_H
#define QRX_OIF_SHELLSECTIONS_H

#include "sections/oif_SectionKeyword.h"
#include "store_interface/records/sections/kseC_BeamSection.h"
#include "store_interface/records/sections/kseC_ShellSections.h"

/// What a section without data lines raises.
inline constexpr char oif_kShellError[] = "Shell general section unimplemented";
/// Whether decks have data lines for a shell section: not for those of a user's code and general ones.
bool oif_HasShellLines(const kseC_Section& section);

/// Shell elements, and below them their rebar layers:
///     *Shell Section, elset=SET, orientation=Ori-1, material=Steel, offset=0.5
///     0.01, 5
///     *Shell General Section, elset=SET, composite
///     0.5, , Steel, 45.
///     0.5, , Steel, Ori-2
/// A user shell raises "Shell general section unimplemented" behind its parameters, a shell of any other kind
/// before anything is written.
class oif_ShellSection final : public oif_SectionKeywordOf<oif_ShellSection> {
public:
    /// `offset`: of the reference surface from the middle one, as a fraction of the thickness.
    oif_ShellSection(const cow_String& setName, const mdl_ObjCow<kseC_Section>& section,
                     const cow_String& orientationName, const cow_String& controlsName, double offset)
        : oif_SectionKeywordOf(setName, section, orientationName, controlsName), offset_(offset) {}
    void Write(utl_Stream& stream) const override;

private:
    void WriteHomogeneous(utl_Stream& stream, const kseC_HomogenousShellSection& shell) const;
    void WriteComposite(utl_Stream& stream, const kseC_CompositeShellSection& shell) const;
    void WriteUser(utl_Stream& stream, const kseC_UserShellSection& shell) const;
    oif_KeywordLine KeywordLine(utl_Stream& stream, const kseC_GeometryShellSection& shell) const;
    static void WriteTemperature(oif_KeywordLine& line, const kseC_GeometryShellSection& shell);
    void WriteOptions(oif_KeywordLine& line, const kseC_GeometryShellSection& shell) const;
    static void WriteRebars(utl_Stream& stream, const kseC_GeometryShellSection& shell);

    double offset_;
};

/// A user shell. Its data lines are unknown: behind the parameters it always raises "Shell general section
/// unimplemented". Nothing for a section of another kind.
class oif_ShellGeneralSection final : public oif_SectionKeywordOf<oif_ShellGeneralSection> {
public:
    /// `offset`: as that of oif_ShellSection.
    oif_ShellGeneralSection(const cow_String& setName, const mdl_ObjCow<kseC_Section>& section,
                            const cow_String& orientationName, const cow_String& controlsName, double offset)
        : oif_SectionKeywordOf(setName, section, orientationName, controlsName), offset_(offset) {}
    void Write(utl_Stream& stream) const override;

private:
    double offset_;
};

/// Rebar layers of the section above: those without an orientation of their own together, then each of the
/// others by itself. Nothing without layers.
///     *Rebar Layer, orientation=Ori-1
///     Layer-1, 0.01, 0.2, 0.005, Steel, 45., 1
///     *Rebar Layer, orientation=Ori-2
///     Layer-2, 0.01, 0.2, 0.005, Steel, , 1
class oif_RebarLayer final : public qkw_KeywordOf<oif_RebarLayer> {
public:
    /// `orientationName`: of the layers without one of their own; may be empty.
    oif_RebarLayer(const kseC_RebarLayers& rebars, const cow_String& orientationName, bool omitPosition)
        : rebars_(rebars), orientationName_(orientationName), omitPosition_(omitPosition) {}
    void Write(utl_Stream& stream) const override;

private:
    bool IsAngular() const;
    void WriteLayer(utl_Stream& stream, const kseC_RebarLayer& layer) const;

    kseC_RebarLayers rebars_;
    cow_String orientationName_;
    bool omitPosition_;
};

/// Transverse shear stiffness of the section above, k12 of a shell only; one of k11 and k22 that is zero
/// takes the value of the other:
///     *Transverse Shear
///     1000., 1000., 0.
class oif_TransverseShear final : public qkw_KeywordOf<oif_TransverseShear> {
public:
    explicit oif_TransverseShear(const kseC_TransverseShearShell& stiffness)
        : oif_TransverseShear(stiffness.k11, stiffness.k22, stiffness.k12, true) {}
    explicit oif_TransverseShear(const kseC_TransverseShearBeam& stiffness)
        : oif_TransverseShear(stiffness.k11, stiffness.k22, 0.0, false) {}
    void Write(utl_Stream& stream) const override;

private:
    oif_TransverseShear(double k11, double k22, double k12, bool isShell)
        : k11_(k11 == 0.0 ? k22 : k11), k22_(k22 == 0.0 ? k11_ : k22), k12_(k12), isShell_(isShell) {}

    double k11_;
    double k22_;
    double k12_;
    bool isShell_;
};

#endif
