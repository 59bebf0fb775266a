#ifndef QRX_OIF_CONTACT_H
#define QRX_OIF_CONTACT_H

#include "keyword_layer/qkw_Keyword.h"
#include "keyword_layer/qkw_ModelInfo.h"
#include "store_interface/records/interactions/kinC_ContactExp.h"

#include <vector>

/// The entries of one list of general contact that a step writes: the names of two surfaces, and a value.
template <class V>
struct oif_SurfacePairLine {
    cow_String first;
    cow_String second;
    V value;
};
template <class V>
using oif_SurfacePairLines = std::vector<oif_SurfacePairLine<V>>;

/// Which pairs of surfaces have which property:
///     *Contact property assignment
///     FIRST , SECOND , Prop-1
/// Nothing while no entry was ever set. An interaction that is no general contact raises; so do the two
/// below.
class oif_ContactPropertyAssignments final : public qkw_KeywordOf<oif_ContactPropertyAssignments> {
public:
    oif_ContactPropertyAssignments(const kinC_Interaction& interaction, const cow_String& step,
                                   const qkw_ModelInfo& modelInfo);
    void Write(utl_Stream& stream) const override;

private:
    oif_SurfacePairLines<cow_String> lines_;
};

/// Which surfaces have a thickness of their own:
///     *Surface property assignment, property=THICKNESS
///     SURFACE , ORIG , 1.
class oif_SurfacePropertyAssignments final : public qkw_KeywordOf<oif_SurfacePropertyAssignments> {
public:
    oif_SurfacePropertyAssignments(const kinC_Interaction& interaction, const cow_String& step,
                                   const qkw_ModelInfo& modelInfo);
    void Write(utl_Stream& stream) const override;

private:
    oif_SurfacePairLines<kinC_SurfThick> lines_;
};

/// Which surface of a pair is the master:
///     *Contact formulation, type=PURE MASTER-SLAVE
///     FIRST , SECOND , MASTER
class oif_ContactFormulationAssignments final : public qkw_KeywordOf<oif_ContactFormulationAssignments> {
public:
    oif_ContactFormulationAssignments(const kinC_Interaction& interaction, const cow_String& step,
                                      const qkw_ModelInfo& modelInfo);
    void Write(utl_Stream& stream) const override;

private:
    oif_SurfacePairLines<kinC_MasterSlave> lines_;
};

/// General contact in a step, in place of that of the steps before:
///     *Contact, op=NEW
///     *Contact Inclusions, ALL EXTERIOR
///     *Contact Exclusions
///     FIRST , SECOND
/// and the three assignments above. Made without an interaction it only ends what was before.
class oif_Contact final : public qkw_KeywordOf<oif_Contact> {
public:
    explicit oif_Contact(const qkw_ModelInfo&) {}
    oif_Contact(const cow_String& name, const mdl_ObjCow<kinC_Interaction>& interaction,
                const cow_String& step, const qkw_ModelInfo& modelInfo);
    void Write(utl_Stream& stream) const override;

private:
    void WriteDomains(utl_Stream& stream, bool inclusions) const;

    bool wholeModel_ = false;
    oif_SurfacePairLines<bool> inclusions_;
    oif_SurfacePairLines<bool> exclusions_;
    qkw_KeywordList assignments_;
};

#endif
