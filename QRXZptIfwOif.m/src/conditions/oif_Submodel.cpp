#include "conditions/oif_Submodel.h"

#include "base/oif_KeywordLine.h"

oif_Submodel::oif_Submodel(bool shellToSolid, const kbcC_SubmodelBC& bc, const cow_String& setName)
    : shellToSolid_(shellToSolid), globalElset_(bc.globalElset), shellThickness_(bc.shellThickness),
      absoluteExteriorTolerance_(bc.absoluteExteriorTolerance), exteriorTolerance_(bc.exteriorTolerance),
      regions_(setName) {}

bool oif_Submodel::IsEqual(const kbcC_SubmodelBC& bc) const {
    return shellThickness_ == bc.shellThickness &&
           absoluteExteriorTolerance_ == bc.absoluteExteriorTolerance &&
           exteriorTolerance_ == bc.exteriorTolerance && globalElset_ == bc.globalElset;
}

void oif_Submodel::Write(utl_Stream& stream) const {
    oif_KeywordLine(stream, "*Submodel")
        .FixedIf(shellToSolid_, ", shell to solid")
        .FixedUnless(", shell thickness=", shellThickness_, 0.0)
        .FixedUnless(", absolute exterior tolerance=", absoluteExteriorTolerance_, 0.0)
        // One word with a capital in it, unlike the parameter before.
        .FixedUnless(", exteriorTolerance=", exteriorTolerance_, 0.0)
        .FixedName(", global elset=", globalElset_)
        .End();
    for (const cow_String& region : regions_) {
        stream << region << ", ";
        stream.LineBreak();
    }
}

void oif_BoundarySubmodelList::Append(const cow_String& stepName, const cow_String& name,
                                      const oif_Boundary& boundary) {
    qkw_KeywordList& keywords = keywords_.GetOrInsert(stepName);
    // All boundaries of a step share the first one's line, whatever theirs would be.
    if (keywords.IsEmpty()) keywords.Append(oif_RawKeyword(boundary.BCSubmodelKwd()));
    keywords.Append(boundary);
    owners_.GetOrInsert(stepName).Append(name);
}

qkw_KeywordList oif_BoundarySubmodelList::Keywords(const cow_String& stepName) const {
    const qkw_KeywordList* kept = keywords_.Find(stepName);
    if (kept == nullptr) return {};
    cow_List<cow_String> names;
    for (const cow_String& owner : owners_.ConstGet(stepName))
        names.Append(oif_Boundary::FixBCNameHack(owner));
    qkw_KeywordList keywords;
    keywords.Append(oif_Comment(cow_String("Name: ") + Joined(names) + " Type: Submodel"));
    keywords.Concatenate(*kept);
    return keywords;
}

cow_List<cow_String> oif_BoundarySubmodelList::Owners(const cow_String& stepName) const {
    const cow_List<cow_String>* owners = owners_.Find(stepName);
    return owners == nullptr ? cow_List<cow_String>() : *owners;
}

cow_String oif_BoundarySubmodelList::Joined(const cow_List<cow_String>& names) {
    cow_String joined;
    const char* separator = "";
    for (const cow_String& name : names) {
        joined += separator;
        joined += name;
        separator = ", ";
    }
    return joined;
}
