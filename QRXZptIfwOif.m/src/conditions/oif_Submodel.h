#ifndef QRX_OIF_SUBMODEL_H
#define QRX_OIF_SUBMODEL_H

#include "base/oif_Comment.h"
#include "conditions/oif_Boundary.h"
#include "foundation/cow_Map.h"
#include "store_interface/records/conditions/kbcC_SupportBCs.h"

/// The boundaries of a submodel that are driven alike:
///     *Submodel, shell to solid, shell thickness=0.1, absolute exterior tolerance=0.2,
///     exteriorTolerance=0.05, global elset=SET
///     REGION,
class oif_Submodel final : public qkw_KeywordOf<oif_Submodel> {
public:
    oif_Submodel(bool shellToSolid, const kbcC_SubmodelBC& bc, const cow_String& setName);
    /// Whether the condition's tolerances, thickness and global set are those of this keyword, exactly.
    bool IsEqual(const kbcC_SubmodelBC& bc) const;
    void AppendRegion(const cow_String& setName) { regions_.Append(setName); }
    void Write(utl_Stream& stream) const override;

private:
    bool shellToSolid_;
    cow_String globalElset_;
    double shellThickness_;
    double absoluteExteriorTolerance_;
    double exteriorTolerance_;
    cow_List<cow_String> regions_;
};

/// The submodel boundaries of each step, under one comment and one keyword line.
class oif_BoundarySubmodelList {
public:
    void Append(const cow_String& stepName, const cow_String& name, const oif_Boundary& boundary);
    /// The comment with all names, the first boundary's keyword line, then the boundaries; nothing for a step
    /// without any.
    qkw_KeywordList Keywords(const cow_String& stepName) const;
    /// The names of the conditions whose boundaries these are, in their order.
    cow_List<cow_String> Owners(const cow_String& stepName) const;
    static cow_String Joined(const cow_List<cow_String>& names);

private:
    cow_Map<cow_String, qkw_KeywordList> keywords_;
    cow_Map<cow_String, cow_List<cow_String>> owners_;
};

#endif
